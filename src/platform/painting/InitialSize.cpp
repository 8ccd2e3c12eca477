#include "platform/access/OpenObject.h"

#include "platform/painting/ObjectLayout.h"
#include "platform/painting/ReportPage.h"
#include "platform/painting/SampleData.h"
#include "platform/painting/TabStrip.h"

#include <algorithm>

/// How large an object's window is when it opens.
namespace tovimar::platform::access {

namespace {

constexpr int kLargestWidth = 6000;
constexpr int kLargestHeight = 16000;
constexpr std::int64_t kMostPixels = 32'000'000;
/// What the host adds to the design surface when it makes room for all of it, twips.
constexpr int kDesignMarginX = 40, kDesignMarginY = 60, kDesignBar = 255;
constexpr int kDatasheetRows = 8;

struct Size {
    int width = 0;
    int height = 0;
};

/// Right edge of what stands on the surface: tabs may reach beyond their control, and a damaged design may
/// place a control beyond its form.
int SurfaceWidth(const Design& design, const SystemMetrics& metrics) {
    int width = painting::PixelsOf(*design.root, "Width", metrics.twipsPerPixelX);
    for (const auto& section : design.Sections())
        for (const auto& control : section.object->children) {
            const int left = painting::PixelsOf(*control, "Left", metrics.twipsPerPixelX);
            width = std::max(width, left + painting::PixelsOf(*control, "Width", metrics.twipsPerPixelX));
            if (control->Is("Tab"))
                width = std::max(width, left + painting::TabStripWidth(*control, metrics));
        }
    return width;
}

Size DesignSize(const OpenObject& object, const SystemMetrics& metrics) {
    const auto sections = object.design->Sections();
    double height = kDesignMarginY;
    for (const auto& section : sections)
        height += static_cast<double>(std::max(0, section.object->Integer("Height", 0))) + kDesignBar;
    // A bar takes a little more room than the host counts for it.
    const int bars =
        static_cast<int>(sections.size()) * (ComputeFrame(metrics, object.FrameSettings()).sectionBarHeight -
                                             kDesignBar / metrics.twipsPerPixelY);
    return {SurfaceWidth(*object.design, metrics) + kDesignMarginX / metrics.twipsPerPixelX,
            RoundToEven(height / metrics.twipsPerPixelY) + bars};
}

Size FormSize(const OpenObject& object, const SystemMetrics& metrics) {
    const auto& design = *object.design;
    const auto& root = *design.root;
    const int records = painting::ShownRecordsOf(design, object.view, 0, metrics);
    const auto heights = painting::HeightsOf(design, object.view, records, metrics);
    Size size;
    size.width =
        SurfaceWidth(design, metrics) + ComputeFrame(metrics, object.FrameSettings()).recordSelectorWidth;
    for (const int height : heights.pixels)
        size.height += height;
    size.height += painting::NavigationHeight(design, metrics);
    const int bars = root.Integer("ScrollBars", 3);
    if (painting::IsContinuous(design, object.view) && (bars == 2 || bars == 3))
        size.width += metrics.scrollWidth;
    if (!root.Flag("AutoResize")) {
        size.width =
            std::max(size.width, (root.Integer("Right") - root.Integer("Left")) / metrics.twipsPerPixelX);
        size.height =
            std::max(size.height, (root.Integer("Bottom") - root.Integer("Top")) / metrics.twipsPerPixelY);
    }
    return size;
}

Size DatasheetSize(const OpenObject& object, const SystemMetrics& metrics) {
    double twips = 0;
    for (const auto* column : DatasheetColumns(*object.design))
        twips += DatasheetColumnWidth(*column);
    return {RoundToEven(twips / metrics.twipsPerPixelX) + metrics.scrollWidth + metrics.scrollWidth,
            metrics.captionHeight + kDatasheetRows * painting::kDatasheetRow +
                painting::NavigationHeight(*object.design, metrics)};
}

Size PreviewSize(const OpenObject& object, const SystemMetrics& metrics) {
    const painting::SampleData sample(*object.design, object.application);
    const auto page = painting::PlanReportPage(*object.design, sample, metrics);
    return {page.width + 2 * painting::kDeskMargin, page.height + 2 * painting::kDeskMargin};
}

Size InitialSize(const OpenObject& object, const SystemMetrics& metrics) {
    switch (object.view) {
    case View::Design:
        return DesignSize(object, metrics);
    case View::Datasheet:
        return DatasheetSize(object, metrics);
    case View::Preview:
        return PreviewSize(object, metrics);
    case View::Form:
        break;
    }
    return FormSize(object, metrics);
}

} // namespace

void SetInitialSize(OpenObject& object, const SystemMetrics& metrics) {
    if (object.design == nullptr || !object.design->root)
        return;
    const auto size = InitialSize(object, metrics);
    object.insideWidth = std::clamp(size.width, metrics.captionHeight * 6, kLargestWidth);
    const auto most = static_cast<int>(kMostPixels / object.insideWidth);
    object.insideHeight = std::clamp(size.height, metrics.captionHeight, std::min(kLargestHeight, most));
}

} // namespace tovimar::platform::access
