#pragma once

#include "platform/access/OpenObject.h"

/// What a report's printer settings say about its sheet, in pixels.
namespace tovimar::platform::painting {

struct PageSetup {
    int left = 0, top = 0, right = 0, bottom = 0; ///< margins
    int columns = 1;
    int columnWidth = 0;
    int columnGap = 0;
    bool across = true; ///< records run along a row before the next row begins, else down a column

    int ColumnLeft(int column) const { return column * (columnWidth + columnGap); }
    /// Of all columns with their gaps.
    int BodyWidth() const { return ColumnLeft(columns - 1) + columnWidth; }
};

/// Bounded against damaged settings; a report without settings has usual margins and one column.
PageSetup PageSetupOf(const access::Design& report, const SystemMetrics& metrics);

} // namespace tovimar::platform::painting
