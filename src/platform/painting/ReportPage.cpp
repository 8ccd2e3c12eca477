#include "platform/painting/ReportPage.h"

#include "platform/painting/ObjectLayout.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::Design;
using access::View;

namespace {

constexpr int kDetailHeight = 300; ///< of all details printed
/// A lower detail holds no text: a rule, or the room that something invisible takes.
constexpr int kLeastDetail = 8;
constexpr int kMostDetails = 14;
constexpr int kMostLevels = 10;
constexpr int kLargestMargin = 56;
constexpr int kUsualMargin = 40;

/// The printer settings begin with the margins: left, top, right, bottom, in twips.
int MarginOf(const Design& design, std::size_t side, const SystemMetrics& metrics) {
    const auto* settings = design.root->Find("PrtMip");
    if (settings == nullptr || settings->form != access::PropertyValue::Form::Bytes ||
        settings->text.size() < 16)
        return kUsualMargin;
    int twips = 0;
    for (std::size_t i = 4; i-- > 0;)
        twips = (twips << 8 & 0xFFFFFF) | static_cast<unsigned char>(settings->text[side * 4 + i]);
    return std::clamp(twips / metrics.twipsPerPixelX, 10, kLargestMargin);
}

class Planner {
public:
    Planner(const Design& design, int records, const SystemMetrics& metrics)
        : design_(design), records_(records), metrics_(metrics) {}

    ReportPage Plan() {
        page_.left = MarginOf(design_, 0, metrics_);
        page_.width = page_.left + PixelsOf(*design_.root, "Width", metrics_.twipsPerPixelX) +
                      MarginOf(design_, 2, metrics_);
        top_ = MarginOf(design_, 1, metrics_);
        Print(1, 0);
        Print(3, 0);
        PrintGroups();
        Print(2, 0);
        const int below = top_ + Height(4) + MarginOf(design_, 3, metrics_);
        // A sheet broader than a postcard looks like paper even when little is printed on it.
        page_.height = std::max(below, page_.width * 5 / 8);
        top_ = page_.height - MarginOf(design_, 3, metrics_) - Height(4);
        Print(4, 0);
        return page_;
    }

private:
    int Height(int number) const {
        const auto* section = design_.Section(number);
        if (section == nullptr || !IsSectionShown(design_, {number, section}, View::Preview))
            return 0;
        return PixelsOf(*section, "Height", metrics_.twipsPerPixelY);
    }

    void Print(int number, int row) {
        const int height = Height(number);
        if (height <= 0)
            return;
        page_.sections.push_back({design_.Section(number), top_, height, row, number == 0 && row % 2 == 1});
        top_ += height;
    }

    void PrintGroups() {
        const int detail = Height(0);
        int details = detail < kLeastDetail ? 1 : std::clamp(kDetailHeight / detail, 1, kMostDetails);
        if (records_ > 0)
            details = std::min(details, records_);
        bool grouped = false;
        for (int level = 0; level < kMostLevels; ++level)
            grouped = grouped || Height(5 + 2 * level) > 0 || Height(6 + 2 * level) > 0;
        const int groups = grouped && details > 3 ? 2 : 1;
        for (int group = 0, row = 0; group < groups; ++group) {
            const int end = details * (group + 1) / groups;
            for (int level = 0; level < kMostLevels; ++level)
                Print(5 + 2 * level, row);
            for (; row < end; ++row)
                Print(0, row);
            for (int level = kMostLevels; level-- > 0;)
                Print(6 + 2 * level, row - 1);
        }
    }

    const Design& design_;
    int records_;
    const SystemMetrics& metrics_;
    ReportPage page_;
    int top_ = 0;
};

} // namespace

ReportPage PlanReportPage(const Design& design, int records, const SystemMetrics& metrics) {
    return Planner(design, records, metrics).Plan();
}

} // namespace tovimar::platform::painting
