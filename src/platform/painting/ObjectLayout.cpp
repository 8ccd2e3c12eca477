#include "platform/painting/ObjectLayout.h"

#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::Design;
using access::DesignObject;
using access::SectionHeights;
using access::SectionRef;
using access::View;

namespace {

/// The host allows 22 inches; a damaged number must not make a picture of gigabytes.
constexpr int kLargestExtent = 4000;
constexpr int kMostRecords = 50;
/// What a continuous form shows when nothing says how high it is.
constexpr int kUsualRecords = 6;
constexpr int kUsualHeight = 400;
constexpr int kPrintOnly = 1, kScreenOnly = 2;

int SectionPixels(const Design& design, int number, const SystemMetrics& metrics) {
    const auto* section = design.Section(number);
    return section == nullptr ? 0 : PixelsOf(*section, "Height", metrics.twipsPerPixelY);
}

/// Sections as they are printed: group headers from the outermost in, group footers from the innermost out.
int PrintOrder(int number) {
    switch (number) {
    case 1:
        return -4000;
    case 3:
        return -3000;
    case 0:
        return 0;
    case 4:
        return 3000;
    case 2:
        return 4000;
    default:
        return number % 2 == 1 ? -2000 + number : 2000 - number;
    }
}

bool IsBound(const DesignObject& control) {
    const auto source = control.Text("ControlSource");
    return (!source.empty() && !source.starts_with('=')) ||
           std::any_of(control.children.begin(), control.children.end(),
                       [](const auto& child) { return IsBound(*child); });
}

/// A form without records shows its detail once. Code may bring the records of bound controls.
bool HasRecords(const Design& design) {
    const auto* detail = design.Section(0);
    return !design.root->Text("RecordSource").empty() || (detail != nullptr && IsBound(*detail));
}

/// Does a shown control below `parent` reach into that part of the client area? Text and drawings may be
/// covered.
bool Reaches(const DesignObject& parent, const SystemMetrics& metrics, const access::Frame& frame, int offset,
             const Rectangle& part) {
    return std::any_of(parent.children.begin(), parent.children.end(), [&](const auto& control) {
        if (control->Is("Label") || control->Is("Line") || control->Is("Rectangle") ||
            !control->Flag("Visible"))
            return false;
        const auto place = access::ControlRectangle(metrics, frame, offset, control->Integer("Left"),
                                                    control->Integer("Top"), control->Integer("Width"),
                                                    control->Integer("Height"));
        return place.left < part.right && place.right > part.left && place.top < part.bottom &&
               place.bottom > part.top;
    });
}

std::string GroupField(const Design& design, int level) {
    int at = 0;
    for (const auto& child : design.root->children)
        if (child->Is("BreakLevel") && at++ == level)
            return child->Text("ControlSource");
    return {};
}

} // namespace

int PixelsOf(const DesignObject& object, std::string_view property, int twipsPerPixel) {
    return std::clamp(access::RoundToEven(static_cast<double>(object.Integer(property, 0)) / twipsPerPixel),
                      0, kLargestExtent);
}

bool IsContinuous(const Design& design, View view) {
    return design.kind == access::ObjectKind::Form && view == View::Form && design.root &&
           design.root->Integer("DefaultView", 1) == 1;
}

bool IsSectionShown(const Design& design, const SectionRef& section, View view) {
    if (view == View::Design)
        return true;
    const bool pageSection = section.number == 3 || section.number == 4;
    if (design.kind == access::ObjectKind::Form && pageSection)
        return false;
    const int when = section.object->Integer("DisplayWhen", 0);
    return access::SectionIsShown(view, section.number, section.object->Flag("Visible")) &&
           when != (view == View::Preview ? kScreenOnly : kPrintOnly);
}

bool HasFooter(const Design& design, View view) {
    const auto* footer = design.Section(2);
    return footer != nullptr && IsSectionShown(design, {2, footer}, view) &&
           footer->Integer("Height", 0) > 0 && !footer->children.empty();
}

access::FrameInput FrameSettingsOf(const Design& design, View view) {
    access::FrameInput input;
    input.view = view;
    if (!design.root)
        return input;
    input.borderStyle = design.root->Integer("BorderStyle", 2);
    input.recordSelectors = design.kind == access::ObjectKind::Form && design.root->Flag("RecordSelectors");
    return input;
}

int NavigationHeight(const Design& design, const SystemMetrics& metrics) {
    const bool shown =
        design.kind == access::ObjectKind::Form && design.root && design.root->Flag("NavigationButtons");
    return shown ? metrics.scrollHeight + 2 : 0;
}

int ShownRecordsOf(const Design& design, View view, int insideHeight, const SystemMetrics& metrics) {
    if (!IsContinuous(design, view) || !HasRecords(design))
        return 1;
    const int detail = SectionPixels(design, 0, metrics);
    if (detail <= 0)
        return 1;
    if (insideHeight <= 0)
        return std::clamp(kUsualHeight / detail, 1, kUsualRecords);
    int around = NavigationHeight(design, metrics);
    for (const auto& section : design.Sections())
        if (section.number != 0 && section.number <= 4 && IsSectionShown(design, section, view))
            around += PixelsOf(*section.object, "Height", metrics.twipsPerPixelY);
    return std::clamp((insideHeight - around) / detail, 1, kMostRecords);
}

FormBars FormBarsOf(const Design& design, View view, int insideWidth, int insideHeight,
                    const SystemMetrics& metrics) {
    constexpr int kLeastWidth = 60;
    const int kind = design.root->Integer("ScrollBars", 3);
    FormBars bars{0, NavigationHeight(design, metrics)};
    if (IsContinuous(design, view) && (kind == 2 || kind == 3) && insideWidth > kLeastWidth)
        bars.scroll = metrics.scrollWidth;
    const auto frame = access::ComputeFrame(metrics, FrameSettingsOf(design, view));
    const auto heights =
        HeightsOf(design, view, ShownRecordsOf(design, view, insideHeight, metrics), metrics);
    const Rectangle right{insideWidth - bars.scroll, 0, insideWidth, insideHeight};
    const Rectangle foot{0, insideHeight - bars.navigation, insideWidth, insideHeight};
    for (const auto& section : PlacedSections(design, view, heights, frame.sectionBarHeight)) {
        if (Reaches(*section.object, metrics, frame, section.offset, right))
            bars.scroll = 0;
        if (Reaches(*section.object, metrics, frame, section.offset, foot))
            bars.navigation = 0;
    }
    return bars;
}

SectionHeights HeightsOf(const Design& design, View view, int records, const SystemMetrics& metrics) {
    SectionHeights heights;
    for (const auto& section : design.Sections()) {
        if (!IsSectionShown(design, section, view))
            continue;
        if (section.number > 4) {
            heights.groups[section.number] = PixelsOf(*section.object, "Height", metrics.twipsPerPixelY);
            continue;
        }
        const auto at = static_cast<std::size_t>(section.number);
        heights.present[at] = true;
        const double twips =
            static_cast<double>(section.object->Integer("Height", 0)) * (at == 0 ? records : 1);
        heights.pixels[at] =
            std::clamp(access::RoundToEven(twips / metrics.twipsPerPixelY), 0, kLargestExtent * 4);
    }
    return heights;
}

std::vector<PlacedSection> PlacedSections(const Design& design, View view, const SectionHeights& heights,
                                          int barHeight) {
    std::vector<PlacedSection> placed;
    for (const auto& section : design.Sections()) {
        if (!IsSectionShown(design, section, view))
            continue;
        const int height = section.number <= 4 ? heights.pixels[static_cast<std::size_t>(section.number)]
                                               : heights.groups.at(section.number);
        placed.push_back({section.number, section.object,
                          access::SectionOffsetY(heights, barHeight, section.number), height});
    }
    std::stable_sort(placed.begin(), placed.end(), [](const PlacedSection& left, const PlacedSection& right) {
        return PrintOrder(left.number) < PrintOrder(right.number);
    });
    return placed;
}

std::string SectionTitle(const Design& design, int number) {
    const std::string whole = design.kind == access::ObjectKind::Report ? "Report" : "Form";
    switch (number) {
    case 0:
        return "Detail";
    case 1:
        return whole + " Header";
    case 2:
        return whole + " Footer";
    case 3:
        return "Page Header";
    case 4:
        return "Page Footer";
    default:
        break;
    }
    auto field = GroupField(design, (number - 5) / 2);
    if (field.empty())
        field = "Group " + std::to_string((number - 5) / 2 + 1);
    return field + (number % 2 == 1 ? " Header" : " Footer");
}

} // namespace tovimar::platform::painting
