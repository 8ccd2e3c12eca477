#include "platform/painting/ControlPainter.h"
#include "platform/painting/TabStrip.h"

#include "platform/painting/ObjectPainter.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::painting {

namespace {

/// Columns without a width of their own share what the others leave, at least an inch each.
std::vector<int> PixelWidths(const std::vector<int>& twips, int available, int twipsPerPixel) {
    int used = 0, open = 0;
    for (const int width : twips) {
        used += std::max(0, width) / twipsPerPixel;
        open += width < 0 ? 1 : 0;
    }
    const int share = open == 0 ? 0 : std::max(open == 1 ? 24 : 96, (available - used) / open);
    std::vector<int> pixels;
    for (const int width : twips)
        pixels.push_back(width < 0 ? share : width / twipsPerPixel);
    return pixels;
}

} // namespace

void ControlPainter::PaintListRow(const std::vector<std::string>& cells, const std::vector<int>& widths,
                                  const Rectangle& area, const TextStyle& style) {
    int left = area.left;
    for (std::size_t i = 0; i < cells.size() && i < widths.size() && left < area.right; ++i) {
        if (widths[i] > 0)
            DrawText(canvas_, cells[i], style,
                     {{left + 2, area.top, std::min(area.right, left + widths[i]), area.bottom}});
        left += widths[i];
    }
}

void ControlPainter::PaintListBox(const Object& control, const Rectangle& area) {
    auto inner = PaintBox(control, area);
    auto style = StyleOf(control);
    if (context_.Designing()) {
        const auto source = control.Text("ControlSource");
        return DrawText(canvas_, source.empty() ? "Unbound" : source, style, {Shrunk(inner, 2)});
    }
    const auto list = sample_.ListRows(control);
    const int height = MeasureText("Xg", style).height + 1;
    const auto rows = static_cast<int>(list.rows.size());
    if (rows * height > inner.Height() && inner.Width() > 3 * context_.metrics.scrollWidth) {
        const int left = inner.right - context_.metrics.scrollWidth;
        PaintScrollBar(canvas_, {left, inner.top, inner.right, inner.bottom}, true);
        inner.right = left;
    }
    const auto widths = PixelWidths(list.widths, inner.Width(), context_.metrics.twipsPerPixelX);
    const ClipTo clip(canvas_, inner);
    for (int row = 0; row < rows && row * height < inner.Height(); ++row) {
        const int top = inner.top + row * height;
        const Rectangle line{inner.left, top, inner.right, top + height};
        PaintListRow(list.rows[static_cast<std::size_t>(row)], widths, line, style);
        if (row == 0 && list.heads)
            canvas_.Fill({line.left, line.bottom - 1, line.right, line.bottom}, SystemColor::kShadow);
    }
}

std::size_t ControlPainter::CurrentPage(const Object& tab) const {
    const auto pages = PagesOf(tab);
    if (context_.pages != nullptr) {
        const auto chosen = context_.pages->find(&tab);
        if (chosen != context_.pages->end() && chosen->second >= 0)
            return std::min(static_cast<std::size_t>(chosen->second), pages.size());
    }
    for (std::size_t i = 0; i < pages.size(); ++i)
        if (IsShown(*pages[i]))
            return i;
    return pages.size();
}

void ControlPainter::PaintTabHeads(const Object& control, const Rectangle& area, std::size_t current) {
    const auto pages = PagesOf(control);
    const auto input = TabInputOf(control, area.left, area.top);
    const auto style = StyleOf(control);
    for (std::size_t i = 0; i < pages.size(); ++i) {
        if (!IsShown(*pages[i]))
            continue;
        auto head = access::TabRectangle(context_.metrics, input, static_cast<int>(i));
        const bool chosen = i == current;
        canvas_.FillGradient(head, chosen ? 0xFFFFFF : 0xF2F2F2, chosen ? SystemColor::kFace : 0xDCDCDC);
        canvas_.Border({head.left, head.top, head.right, head.bottom + 1}, 0x9A9A9A);
        if (chosen) {
            canvas_.Fill({head.left + 1, head.bottom, head.right - 1, head.bottom + 1}, SystemColor::kFace);
            canvas_.Fill({head.left, head.top, head.right, head.top + 2}, 0x6C9BD2);
        }
        DrawText(canvas_, input.captions[i], style,
                 {{head.left + 2, head.top + 1, head.right - 2, head.bottom},
                  Align::Center,
                  VerticalAlign::Middle,
                  false,
                  true});
    }
}

void ControlPainter::PaintTab(const Object& control, const Rectangle& area) {
    const auto pages = PagesOf(control);
    const auto current = CurrentPage(control);
    const int styleNumber = control.Integer("Style", 0);
    const auto ground = place_.ground;
    if (canvas_.Visible(area) && styleNumber != 2) {
        const int heads = access::TabHeight(context_.metrics, TabInputOf(control, area.left, area.top));
        const Rectangle body{area.left, area.top + heads, area.right, area.bottom};
        if (control.Integer("BackStyle", 1) != 0) {
            canvas_.Fill(body, SystemColor::kFace);
            place_.ground = SystemColor::kFace;
        }
        canvas_.Border(body, 0x9A9A9A);
        PaintTabHeads(control, area, current);
    }
    if (current < pages.size())
        PaintChildren(*pages[current]);
    place_.ground = ground;
    for (const auto& child : control.children)
        if (!child->Is("Page"))
            Paint(*child);
}

void ControlPainter::PaintSubform(const Object& control, const Rectangle& area) {
    canvas_.Fill(area, SystemColor::kWindow);
    {
        const ClipTo clip(canvas_, area);
        PaintSourceObject(context_, control.Text("SourceObject"), sample_.LinksOf(control, place_.row), area);
    }
    BorderLook look;
    look.effect = control.Integer("SpecialEffect", 0);
    look.style = control.Integer("OldBorderStyle", 1);
    look.width = BorderPixels(control);
    look.color = DesignColor(control, "Border", SystemColor::kText, context_.Theme());
    PaintBorder(canvas_, area, look);
}

} // namespace tovimar::platform::painting
