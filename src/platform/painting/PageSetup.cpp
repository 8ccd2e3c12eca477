#include "platform/painting/PageSetup.h"

#include "platform/painting/ObjectLayout.h"

#include <algorithm>
#include <optional>

namespace tovimar::platform::painting {

namespace {

constexpr int kLeastMargin = 10, kUsualMargin = 40, kLargestMargin = 56;
constexpr int kMostColumns = 12;
constexpr int kLeastColumn = 20;
constexpr int kDownFirst = 1954;

/// The settings are numbers of 32 bits, least byte first; lengths in twips.
enum Number : std::size_t { Left, Top, Right, Bottom, ItemWidth = 5, SameSize = 7, Columns, Gap, Order = 11 };

std::optional<int> NumberAt(const access::Design& report, std::size_t number) {
    const auto* settings = report.root->Find("PrtMip");
    const bool known = settings != nullptr && settings->form == access::PropertyValue::Form::Bytes &&
                       settings->text.size() >= (number + 1) * 4;
    if (!known)
        return std::nullopt;
    unsigned value = 0;
    for (std::size_t i = 4; i-- > 0;)
        value = value << 8 | static_cast<unsigned char>(settings->text[number * 4 + i]);
    return static_cast<int>(std::min(value, 0xFFFFFFU));
}

int MarginOf(const access::Design& report, std::size_t side, int twipsPerPixel) {
    const auto twips = NumberAt(report, side);
    return twips ? std::clamp(*twips / twipsPerPixel, kLeastMargin, kLargestMargin) : kUsualMargin;
}

} // namespace

PageSetup PageSetupOf(const access::Design& report, const SystemMetrics& metrics) {
    const int twips = metrics.twipsPerPixelX;
    PageSetup setup;
    setup.left = MarginOf(report, Left, twips);
    setup.top = MarginOf(report, Top, metrics.twipsPerPixelY);
    setup.right = MarginOf(report, Right, twips);
    setup.bottom = MarginOf(report, Bottom, metrics.twipsPerPixelY);
    setup.columns = std::clamp(NumberAt(report, Columns).value_or(1), 1, kMostColumns);
    setup.columnWidth = PixelsOf(*report.root, "Width", twips);
    setup.across = NumberAt(report, Order).value_or(0) != kDownFirst;
    const int item = NumberAt(report, ItemWidth).value_or(0) / twips;
    if (setup.columns == 1)
        return setup;
    if (NumberAt(report, SameSize).value_or(1) == 0 && item >= kLeastColumn)
        setup.columnWidth = std::min(item, setup.columnWidth);
    setup.columnGap = std::clamp(NumberAt(report, Gap).value_or(0) / twips, 0, setup.columnWidth);
    return setup;
}

} // namespace tovimar::platform::painting
