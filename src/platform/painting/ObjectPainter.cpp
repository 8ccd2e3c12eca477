#include "platform/painting/ObjectPainter.h"

#include "platform/painting/ReportPage.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::DesignObject;
using access::View;

ObjectPainter::ObjectPainter(const PaintContext& context)
    : context_(context), canvas_(context.canvas),
      sample_(context.design, context.Designing() ? nullptr : context.application, context.links),
      frame_(access::ComputeFrame(context.metrics, FrameSettingsOf(context.design, context.view))) {}

void ObjectPainter::Paint(const Rectangle& area) {
    if (!context_.design.root || !canvas_.Visible(area))
        return;
    const ClipTo clip(canvas_, area);
    switch (context_.view) {
    case View::Design:
        return PaintDesign(area);
    case View::Datasheet:
        return PaintDatasheet(area);
    case View::Preview:
        return context_.outer.empty() ? PaintPreview(area) : PaintPrintedBody(area);
    case View::Form:
        return PaintForm(area);
    }
}

Color ObjectPainter::GroundOf(const DesignObject& section, bool alternate) const {
    const auto ground = DesignColor(section, "Back", SystemColor::kWindow, context_.Theme());
    return alternate ? DesignColor(section, "AlternateBack", ground, context_.Theme()) : ground;
}

void ObjectPainter::PaintControls(const DesignObject& section, int left, int top, const Rectangle& clip,
                                  int row, Color ground, int growth) {
    const ClipTo clipped(canvas_, clip);
    SectionPlace place;
    place.frame = frame_;
    place.originX = left;
    // Controls count from the section's bar, whose height the frame holds.
    place.originY = top - frame_.sectionBarHeight;
    place.row = row;
    place.ground = ground;
    place.growth = growth;
    ControlPainter(context_, sample_, place).PaintChildren(section);
}

void ObjectPainter::PaintFormBackground(const Rectangle& area) {
    const auto* detail = context_.design.Section(0);
    canvas_.Fill(area, detail == nullptr ? SystemColor::kFace : GroundOf(*detail, false));
}

void ObjectPainter::PaintForm(const Rectangle& area) {
    const auto& design = context_.design;
    PaintFormBackground(area);
    const auto bars = FormBarsOf(design, context_.view, area.Width(), area.Height(), context_.metrics);
    const Rectangle inner{area.left, area.top, area.right - bars.scroll, area.bottom - bars.navigation};
    if (bars.scroll > 0)
        PaintScrollBar(canvas_, {inner.right, inner.top, area.right, inner.bottom}, true);
    if (bars.navigation > 0)
        PaintNavigationBar(canvas_, {area.left, inner.bottom, area.right, area.bottom},
                           sample_.RecordCount());

    const int records = ShownRecordsOf(design, context_.view, area.Height(), context_.metrics);
    const auto heights = HeightsOf(design, context_.view, records, context_.metrics);
    const ClipTo clip(canvas_, inner);
    for (const auto& section : PlacedSections(design, context_.view, heights, frame_.sectionBarHeight)) {
        if (section.number == 0)
            PaintRecords(section, inner, records);
        else
            PaintRecord(section,
                        {inner.left, inner.top + section.offset, inner.right,
                         inner.top + section.offset + section.height},
                        inner, 0, false);
    }
}

void ObjectPainter::PaintRecords(const PlacedSection& section, const Rectangle& area, int records) {
    const bool continuous = IsContinuous(context_.design, context_.view);
    const double twips = section.object->Integer("Height", 0);
    const bool last = !HasFooter(context_.design, context_.view);
    // A record cut off at the foot of the window shows its head.
    const int shown = continuous && last && records > 1 ? records + 1 : records;
    const int known = sample_.RecordCount();
    constexpr int kSampleRecords = 4;
    const int filled = known < 0 ? std::min(shown, kSampleRecords) : std::max(1, known);
    for (int row = 0; row < shown; ++row) {
        const auto edge = [&](int at) {
            return area.top + section.offset +
                   access::RoundToEven(at * twips / context_.metrics.twipsPerPixelY);
        };
        const Rectangle place{area.left, edge(row), area.right,
                              continuous ? edge(row + 1) : edge(0) + section.height};
        if (place.top >= area.bottom || row >= filled)
            break;
        PaintRecord(section, place, area, row, row == 0);
    }
}

void ObjectPainter::PaintRecord(const PlacedSection& section, const Rectangle& place, const Rectangle& area,
                                int row, bool current) {
    const bool alternate = section.number == 0 && row % 2 == 1;
    const auto ground = GroundOf(*section.object, alternate);
    canvas_.Fill(place, ground);
    PaintControls(*section.object, area.left, place.top, place, row, ground);
    const bool continuous = IsContinuous(context_.design, context_.view);
    if (section.number == 0 && frame_.recordSelectorWidth > 0)
        PaintRecordSelector(canvas_,
                            {area.left, place.top, area.left + frame_.recordSelectorWidth,
                             continuous ? place.bottom : std::max(place.bottom, area.bottom)},
                            current);
    if (context_.design.root->Flag("DividingLines") && continuous && section.number != 2)
        canvas_.Fill({area.left, place.bottom - 1, area.right, place.bottom}, SystemColor::kShadow);
}

void ObjectPainter::PaintDesign(const Rectangle& area) {
    const auto& design = context_.design;
    canvas_.Fill(area, 0xC4C8CD);
    const auto heights = HeightsOf(design, context_.view, 1, context_.metrics);
    const int width = PixelsOf(*design.root, "Width", context_.metrics.twipsPerPixelX);
    for (const auto& section : PlacedSections(design, context_.view, heights, frame_.sectionBarHeight)) {
        const int top = area.top + section.offset;
        const int content = top + frame_.sectionBarHeight;
        PaintSectionBar(canvas_, {area.left, top, area.right, content}, SectionTitle(design, section.number));
        const Rectangle place{area.left, content, area.left + width, content + section.height};
        const auto ground = GroundOf(*section.object, false);
        canvas_.Fill(place, ground);
        PaintGrid(place, ground);
        // Below the controls: one that reaches beyond the surface is whole all the same.
        canvas_.Fill({place.right, place.top, place.right + 1, place.bottom}, SystemColor::kDarkShadow);
        PaintControls(*section.object, area.left, content, {area.left, content, area.right, place.bottom}, 0,
                      ground);
    }
}

void ObjectPainter::PaintGrid(const Rectangle& area, Color ground) {
    // Every eighth of an inch: close enough to read as a design surface, thin enough to leave text clear.
    constexpr int kStep = 12;
    const auto dot = Tinted(ground, 100, ground == 0 ? 100 : 78);
    for (int y = area.top + kStep; y < area.bottom; y += kStep)
        for (int x = area.left + kStep; x < area.right; x += kStep)
            canvas_.Fill({x, y, x + 1, y + 1}, dot);
}

void ObjectPainter::PaintPreview(const Rectangle& area) {
    canvas_.Fill(area, SystemColor::kDesk);
    const auto page = PlanReportPage(context_.design, sample_, context_.metrics);
    const Rectangle sheet{area.left + kDeskMargin, area.top + kDeskMargin,
                          area.left + kDeskMargin + page.width, area.top + kDeskMargin + page.height};
    canvas_.Fill(Moved(sheet, 3, 3), 0x808080);
    canvas_.Fill(sheet, SystemColor::kWindow);
    canvas_.Border(sheet, 0x606060);
    for (const auto& section : page.sections)
        PaintPrinted(section, sheet.left + page.left, sheet.top, sheet.right);
}

void ObjectPainter::PaintPrintedBody(const Rectangle& area) {
    PaintFormBackground(area);
    for (const auto& section : PlanPrintedBody(context_.design, sample_, context_.metrics))
        PaintPrinted(section, area.left, area.top, area.right);
}

void ObjectPainter::PaintPrinted(const PrintedSection& section, int left, int top, int right) {
    const Rectangle place{left + section.left, top + section.top,
                          std::min(right, left + section.left + section.width),
                          top + section.top + section.height};
    const auto ground = GroundOf(*section.object, section.alternate);
    canvas_.Fill(place, ground);
    sample_.LimitAggregates(section.firstAdded, section.added);
    PaintControls(*section.object, place.left, place.top, place, section.row, ground, section.growth);
}

} // namespace tovimar::platform::painting
