#pragma once

#include "platform/painting/ControlPainter.h"
#include "platform/painting/ObjectLayout.h"
#include "platform/painting/PaintContext.h"

#include <string>

namespace tovimar::platform::painting {

struct PrintedSection;

/// Paints one form or report into the client area of its window or into the frame of a subform.
class ObjectPainter {
public:
    explicit ObjectPainter(const PaintContext& context);

    void Paint(const Rectangle& area);

private:
    void PaintForm(const Rectangle& area);
    void PaintRecords(const PlacedSection& section, const Rectangle& area, int records);
    void PaintRecord(const PlacedSection& section, const Rectangle& place, const Rectangle& area, int row,
                     bool current);
    void PaintFormBackground(const Rectangle& area);
    void PaintDesign(const Rectangle& area);
    void PaintGrid(const Rectangle& area, Color ground);
    void PaintDatasheet(const Rectangle& area);
    void PaintCell(const access::DesignObject& column, const Rectangle& cell, int row);
    void PaintPreview(const Rectangle& area);
    void PaintPrintedBody(const Rectangle& area);
    /// A section of a sheet whose body begins at (left, top).
    void PaintPrinted(const PrintedSection& section, int left, int top, int right);
    Color GroundOf(const access::DesignObject& section, bool alternate) const;
    /// Controls of a section whose content begins at `top`.
    void PaintControls(const access::DesignObject& section, int left, int top, const Rectangle& clip, int row,
                       Color ground, int growth = 0);

    const PaintContext& context_;
    Canvas& canvas_;
    SampleData sample_;
    access::Frame frame_;
};

/// Paints what a subform's `SourceObject` names; "Table." and "Query." give a datasheet. Nothing for an
/// object that isn't known, lies too deep or would hold itself.
void PaintSourceObject(const PaintContext& outer, const std::string& sourceObject,
                       std::vector<RecordLink> links, const Rectangle& area);

} // namespace tovimar::platform::painting
