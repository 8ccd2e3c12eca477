#include "platform/access/FormLayout.h"

#include "platform/text/Text.h"

#include <cmath>
#include <cstddef>
#include <limits>

namespace tovimar::platform::access {

namespace {

/// Space that the title bar takes beside its caption, pixels.
constexpr int kTitlePadding = 3;
/// Height of a tab that the design leaves to the host, twips.
constexpr double kNaturalTabHeight = 284;
/// Twips a character of a tab's caption takes in a font of 8 points.
constexpr double kTabCharacterWidth = 668.0 / 4;
constexpr double kBoldTabFactor = 4.65 / 4;
constexpr int kBoldFrom = 600;

/// Bar and height of a section; nothing when it is absent and may be left out.
int Extent(const SectionHeights& heights, int bar, std::size_t section, bool always = false) {
    return heights.present[section] || always ? bar + heights.pixels[section] : 0;
}

/// Bars and heights of the group headers (odd numbers) or footers with numbers in [from, to).
int GroupExtent(const SectionHeights& heights, int bar, bool headers, int from, int to) {
    int extent = 0;
    for (const auto& [number, height] : heights.groups)
        if ((number % 2 == 1) == headers && number >= from && number < to)
            extent += bar + height;
    return extent;
}

double NaturalTabWidth(const SystemMetrics& metrics, const TabInput& input, std::size_t index) {
    const double weight = input.fontWeight >= kBoldFrom ? kBoldTabFactor : 1.0;
    const double scale = input.fontSize * weight / 8;
    const auto length = static_cast<double>(text::Length(input.captions[index]));
    return kTabCharacterWidth * length * scale * (3.0 / 4) / metrics.twipsPerPixelX;
}

} // namespace

int RoundToEven(double value) {
    if (!(std::fabs(value) < std::numeric_limits<int>::max()))
        return 0;
    const double below = std::floor(value);
    const double part = value - below;
    const bool up = part > 0.5 || (part == 0.5 && std::fmod(below, 2.0) != 0.0);
    return static_cast<int>(below) + (up ? 1 : 0);
}

Frame ComputeFrame(const SystemMetrics& metrics, const FrameInput& input) {
    Frame result;
    const bool formView = input.view == View::Form;
    const bool untitled = formView && input.borderStyle == 0;
    const bool thin = formView && (input.borderStyle == 1 || input.borderStyle == 3);
    result.frame = untitled || thin ? 0 : metrics.borderWidth * 4;
    result.titleHeight = untitled ? 0 : metrics.captionHeight + kTitlePadding;
    result.sectionBarHeight = formView ? 0 : metrics.scrollHeight + 1;
    result.recordSelectorWidth = formView && input.recordSelectors ? metrics.scrollWidth : 0;
    result.extraTop = input.rulerOn ? result.sectionBarHeight + result.frame : 0;
    result.extraLeft = result.frame + (input.rulerOn ? metrics.scrollWidth : 0);
    return result;
}

int SectionOffsetY(const SectionHeights& heights, int sectionBarHeight, int section) {
    const auto extent = [&](std::size_t index, bool always = false) {
        return Extent(heights, sectionBarHeight, index, always);
    };
    // Nothing printed has a bar; controls count from one.
    if (const auto printed = heights.printed.find(section); printed != heights.printed.end())
        return printed->second.second - sectionBarHeight;
    constexpr int kFirst = 5, kEnd = 1000;
    const auto headers = [&](int to) { return GroupExtent(heights, sectionBarHeight, true, kFirst, to); };
    const auto footers = [&](int from) { return GroupExtent(heights, sectionBarHeight, false, from, kEnd); };
    const auto body = [&] { return headers(kEnd) + extent(0, true) + footers(kFirst); };
    switch (section) {
    case 3:
        return extent(1);
    case 0:
        return extent(1) + extent(3) + headers(kEnd);
    case 4:
        return extent(1) + extent(3, true) + body();
    case 2:
        // Page sections come in pairs: the page header speaks for the footer as well.
        return extent(1) + extent(3) + body() + (heights.present[3] ? extent(4, true) : 0);
    default:
        break;
    }
    if (heights.groups.count(section) == 0)
        return 0;
    const int above = extent(1) + extent(3);
    return section % 2 == 1 ? above + headers(section)
                            : above + headers(kEnd) + extent(0, true) + footers(section + 1);
}

int SectionOffsetX(const SectionHeights& heights, int section) {
    const auto printed = heights.printed.find(section);
    return printed == heights.printed.end() ? 0 : printed->second.first;
}

Rectangle ControlRectangle(const SystemMetrics& metrics, const Frame& frame, int sectionOffset, double left,
                           double top, double width, double height) {
    Rectangle result;
    result.left = RoundToEven(left / metrics.twipsPerPixelX) + frame.recordSelectorWidth;
    result.top = RoundToEven(top / metrics.twipsPerPixelY + sectionOffset + frame.sectionBarHeight);
    result.right = result.left + RoundToEven(width / metrics.twipsPerPixelX);
    result.bottom = result.top + RoundToEven(height / metrics.twipsPerPixelY);
    return result;
}

Rectangle ColumnRectangle(const SystemMetrics& metrics, double left, double width) {
    Rectangle result;
    result.left = RoundToEven(left / metrics.twipsPerPixelX + metrics.scrollWidth);
    result.right = result.left + RoundToEven(width / metrics.twipsPerPixelX);
    result.bottom = metrics.captionHeight;
    return result;
}

int TabHeight(const SystemMetrics& metrics, const TabInput& input) {
    const double twips = input.fixedHeight == 0 ? kNaturalTabHeight : input.fixedHeight;
    return RoundToEven(twips / metrics.twipsPerPixelY);
}

Rectangle TabRectangle(const SystemMetrics& metrics, const TabInput& input, int index) {
    if (index < 0 || static_cast<std::size_t>(index) >= input.captions.size())
        return {};
    double left = input.controlLeft;
    double width = input.fixedWidth / metrics.twipsPerPixelX;
    if (width != 0) {
        left += width * index;
    } else {
        for (int i = 0; i < index; ++i)
            left += NaturalTabWidth(metrics, input, static_cast<std::size_t>(i));
        width = NaturalTabWidth(metrics, input, static_cast<std::size_t>(index));
    }
    Rectangle result;
    result.left = RoundToEven(left);
    result.top = input.controlTop;
    result.right = result.left + RoundToEven(width);
    result.bottom = result.top + TabHeight(metrics, input);
    return result;
}

} // namespace tovimar::platform::access
