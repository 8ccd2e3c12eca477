#include "platform/painting/PrintedGrowth.h"

#include "platform/painting/ObjectLayout.h"
#include "platform/painting/ReportPage.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::DesignObject;

namespace {

constexpr int kMostGrowth = 1200;

bool LiesBelow(const DesignObject& control, const DesignObject& other) {
    const bool drawing = control.Is("Line") || control.Is("Rectangle");
    return &control != &other && !drawing && control.Flag("Visible") &&
           control.Integer("Top", 0) >= other.Integer("Top", 0) + other.Integer("Height", 0);
}

int PrintedHeight(const DesignObject& subreport, const SampleData& sample, int row,
                  const SystemMetrics& metrics) {
    auto* application = sample.Application();
    const auto source = subreport.Text("SourceObject");
    if (application == nullptr || !text::StartsWithIgnoringCase(source, "Report.") ||
        sample.Depth() >= kDeepestSample)
        return 0;
    const auto* design = application->FindDesign(access::ObjectKind::Report, source.substr(7));
    if (design == nullptr || !design->root)
        return 0;
    const SampleData inner(*design, application, sample.LinksOf(subreport, row), sample.Depth() + 1);
    int height = 0;
    for (const auto& section : PlanPrintedBody(*design, inner, metrics))
        height = std::max(height, section.top + section.height);
    return height;
}

} // namespace

bool MayGrow(const DesignObject& subreport) {
    const auto* own = subreport.Find("CanGrow");
    // A subreport grows unless its design says otherwise.
    return subreport.Is("Subform") &&
           (own == nullptr ||
            (own->form != access::PropertyValue::Form::NotDefault && subreport.Flag("CanGrow")));
}

int GrowthOf(const DesignObject& section, const SampleData& sample, int row, const SystemMetrics& metrics) {
    if (!section.Flag("CanGrow"))
        return 0;
    int growth = 0;
    for (const auto& control : section.children) {
        const bool followed = std::any_of(section.children.begin(), section.children.end(),
                                          [&](const auto& other) { return LiesBelow(*other, *control); });
        if (!MayGrow(*control) || followed || !control->Flag("Visible"))
            continue;
        const int designed = PixelsOf(*control, "Height", metrics.twipsPerPixelY);
        growth = std::max(growth, PrintedHeight(*control, sample, row, metrics) - designed);
    }
    return std::clamp(growth, 0, kMostGrowth);
}

} // namespace tovimar::platform::painting
