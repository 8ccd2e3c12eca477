#include "platform/painting/ObjectPainter.h"

#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::Design;
using access::DesignObject;
using access::ObjectKind;
using access::View;

namespace {

constexpr int kRecordsShown = 25;
constexpr int kTableColumn = 96;

TextStyle CellStyle(const DesignObject* form) {
    TextStyle style;
    style.family = form == nullptr ? "Tahoma" : form->Text("DatasheetFontName", "Tahoma");
    style.size = form == nullptr ? 8 : std::clamp(form->Integer("DatasheetFontHeight", 8), 6, 11);
    return style;
}

std::string ColumnTitle(const DesignObject& column) {
    const auto own = column.Text("DatasheetCaption");
    if (!own.empty())
        return own;
    for (const auto& child : column.children)
        if (child->Is("Label")) {
            auto caption = text::ReplaceAll(child->Text("Caption"), "&", "");
            if (caption.ends_with(':'))
                caption.pop_back();
            if (!caption.empty())
                return caption;
        }
    return column.name;
}

/// Head, selectors and lines of a datasheet; gives the rows' places one by one.
template <typename PaintRow>
void PaintRows(Canvas& canvas, const SystemMetrics& metrics, const Rectangle& area, int right, int records,
               const PaintRow& paintRow) {
    PaintColumnHead(
        canvas, {area.left, area.top, area.left + metrics.scrollWidth, area.top + metrics.captionHeight}, {});
    int top = area.top + metrics.captionHeight;
    for (int row = 0; row < records && top < area.bottom; ++row, top += kDatasheetRow) {
        PaintRecordSelector(canvas, {area.left, top, area.left + metrics.scrollWidth, top + kDatasheetRow},
                            row == 0);
        paintRow(row, top);
        canvas.Fill({area.left + metrics.scrollWidth, top + kDatasheetRow - 1, right, top + kDatasheetRow},
                    SystemColor::kGridLine);
    }
}

/// A table or query as a subform shows it.
void PaintTable(const PaintContext& context, const std::string& name, const Rectangle& area) {
    const auto* records = context.application == nullptr || context.Designing()
                              ? nullptr
                              : context.application->FindRecords(name, kRecordsShown);
    context.canvas.Fill(area, SystemColor::kWindow);
    const std::size_t columns = records == nullptr ? 0 : records->columns.size();
    const int first = area.left + context.metrics.scrollWidth;
    const auto columnAt = [&](std::size_t i) { return first + static_cast<int>(i) * kTableColumn; };
    std::size_t shown = 0;
    for (; shown < columns && columnAt(shown) < area.right; ++shown)
        PaintColumnHead(
            context.canvas,
            {columnAt(shown), area.top, columnAt(shown + 1), area.top + context.metrics.captionHeight},
            records->columns[shown].name);
    const int count = records == nullptr ? 0 : static_cast<int>(records->rows.size());
    PaintRows(context.canvas, context.metrics, area, columnAt(shown), count, [&](int row, int top) {
        const auto& cells = records->rows[static_cast<std::size_t>(row)];
        for (std::size_t i = 0; i < shown && i < cells.size(); ++i)
            DrawText(context.canvas, cells[i], CellStyle(nullptr),
                     {{columnAt(i) + 3, top, columnAt(i + 1) - 2, top + kDatasheetRow},
                      Align::Left,
                      VerticalAlign::Middle});
    });
}

struct SourceObject {
    std::string kind; ///< folded: "form", "report", "table", "query", or empty
    std::string name;
};

SourceObject SplitSource(const std::string& sourceObject) {
    const auto point = sourceObject.find('.');
    if (point != std::string::npos) {
        const auto kind = text::FoldCase(sourceObject.substr(0, point));
        if (kind == "form" || kind == "report" || kind == "table" || kind == "query")
            return {kind, sourceObject.substr(point + 1)};
    }
    return {{}, sourceObject};
}

const Design* FindSource(access::ApplicationSource& application, const SourceObject& source,
                         bool reportsFirst) {
    if (source.kind == "form")
        return application.FindDesign(ObjectKind::Form, source.name);
    if (source.kind == "report")
        return application.FindDesign(ObjectKind::Report, source.name);
    const auto first = reportsFirst ? ObjectKind::Report : ObjectKind::Form;
    const auto second = reportsFirst ? ObjectKind::Form : ObjectKind::Report;
    const auto* design = application.FindDesign(first, source.name);
    return design != nullptr ? design : application.FindDesign(second, source.name);
}

View ViewWithin(View outer, const Design& inner) {
    if (outer == View::Design)
        return View::Design;
    if (inner.kind == ObjectKind::Report)
        return View::Preview;
    return inner.root->Integer("DefaultView", 1) == 2 ? View::Datasheet : View::Form;
}

} // namespace

void ObjectPainter::PaintCell(const DesignObject& column, const Rectangle& cell, int row) {
    if (column.Is("CheckBox")) {
        const int left = (cell.left + cell.right - 11) / 2;
        return PaintCheckMark(canvas_, {left, cell.top + 3, left + 11, cell.bottom - 4},
                              sample_.Checked(column, row), false);
    }
    DrawText(canvas_, sample_.Text(column, row), CellStyle(context_.design.root.get()),
             {{cell.left + 3, cell.top, cell.right - 3, cell.bottom},
              sample_.AlignsRight(column, row) ? Align::Right : Align::Left,
              VerticalAlign::Middle});
}

void ObjectPainter::PaintDatasheet(const Rectangle& area) {
    const auto& design = context_.design;
    const auto& metrics = context_.metrics;
    canvas_.Fill(area, SystemColor::kWindow);
    Rectangle inner = area;
    const int navigation = NavigationHeight(design, metrics);
    inner.bottom -= navigation;
    if (navigation > 0)
        PaintNavigationBar(canvas_, {area.left, inner.bottom, area.right, area.bottom},
                           sample_.RecordCount());

    struct Column {
        const DesignObject* object;
        Rectangle place;
    };
    std::vector<Column> columns;
    double twips = 0;
    for (const auto* column : access::DatasheetColumns(design)) {
        const int width = access::DatasheetColumnWidth(*column);
        const auto place = Moved(access::ColumnRectangle(metrics, twips, width), inner.left, inner.top);
        twips += width;
        if (width > 0 && place.left < inner.right)
            columns.push_back({column, place});
    }
    const ClipTo clip(canvas_, inner);
    // From the right, as a column keeps its line where the next one begins on it.
    for (auto column = columns.rbegin(); column != columns.rend(); ++column)
        PaintColumnHead(canvas_, column->place, ColumnTitle(*column->object));
    const int known = sample_.RecordCount();
    const int right = columns.empty() ? inner.left + metrics.scrollWidth : columns.back().place.right;
    PaintRows(canvas_, metrics, inner, right, known < 0 ? 8 : known, [&](int row, int top) {
        for (const auto& column : columns) {
            PaintCell(*column.object, {column.place.left, top, column.place.right, top + kDatasheetRow}, row);
            canvas_.Fill({column.place.right - 1, top, column.place.right, top + kDatasheetRow},
                         SystemColor::kGridLine);
        }
    });
}

void PaintSourceObject(const PaintContext& outer, const std::string& sourceObject,
                       std::vector<RecordLink> links, const Rectangle& area) {
    if (sourceObject.empty() || outer.application == nullptr || outer.outer.size() + 1 >= kDeepestSubform)
        return;
    const auto source = SplitSource(sourceObject);
    if (source.kind == "table" || source.kind == "query")
        return PaintTable(outer, source.name, area);
    const auto* design = FindSource(*outer.application, source, outer.design.kind == ObjectKind::Report);
    const bool itself = design == &outer.design ||
                        std::find(outer.outer.begin(), outer.outer.end(), design) != outer.outer.end();
    if (design == nullptr || !design->root || itself)
        return;
    PaintContext context{
        outer.canvas, outer.metrics, *design,         outer.application, ViewWithin(outer.view, *design),
        outer.pages,  outer.outer,   std::move(links)};
    context.outer.push_back(&outer.design);
    ObjectPainter(context).Paint(area);
}

} // namespace tovimar::platform::painting
