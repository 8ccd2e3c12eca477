#pragma once

#include "platform/painting/SampleData.h"

/// How much higher than designed a report prints what may grow.
namespace tovimar::platform::painting {

/// Does a report's subreport take the height of what it prints?
bool MayGrow(const access::DesignObject& subreport);
/// Pixels that a section gains in a record through its subreports. A subreport with something below it
/// keeps its height.
int GrowthOf(const access::DesignObject& section, const SampleData& sample, int row,
             const SystemMetrics& metrics);

} // namespace tovimar::platform::painting
