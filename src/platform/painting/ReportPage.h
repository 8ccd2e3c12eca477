#pragma once

#include "platform/access/OpenObject.h"

#include <vector>

/// The page of a report as its preview shows it: which sections are printed, how often and where.
namespace tovimar::platform::painting {

struct PrintedSection {
    const access::DesignObject* object = nullptr;
    int top = 0; ///< on the sheet
    int height = 0;
    int left = 0; ///< within the margins
    int width = 0;
    int row = 0; ///< record, from 0
    bool alternate = false;
    /// Records that the sums of a group section go over; a count of 0 for all.
    int firstAdded = 0;
    int added = 0;
    int growth = 0; ///< pixels that its subreports need more than designed
};

struct ReportPage {
    int width = 0; ///< of the sheet
    int height = 0;
    int left = 0; ///< margin
    std::vector<PrintedSection> sections;
};

class SampleData;
ReportPage PlanReportPage(const access::Design& design, const SampleData& sample,
                          const SystemMetrics& metrics);

/// What a report within a page prints: sections without those of the page, from 0; nothing without records.
std::vector<PrintedSection> PlanPrintedBody(const access::Design& design, const SampleData& sample,
                                            const SystemMetrics& metrics);

/// Grey ground around the sheet.
inline constexpr int kDeskMargin = 14;

} // namespace tovimar::platform::painting
