#include "platform/painting/ReportPage.h"

#include "platform/painting/ObjectLayout.h"
#include "platform/painting/SampleData.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::Design;
using access::View;

namespace {

constexpr int kDetailHeight = 300; ///< of all details printed
/// A lower detail holds no text: a rule, or the room that something invisible takes.
constexpr int kLeastDetail = 8;
constexpr int kMostDetails = 14;
constexpr int kGroupsHeight = 400; ///< of groups, at which no further one begins
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
    Planner(const Design& design, const SampleData& sample, const SystemMetrics& metrics)
        : design_(design), sample_(sample), records_(sample.RecordCount()), metrics_(metrics) {}

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

    void Print(int number, int row, int firstAdded = 0, int added = 0) {
        const int height = Height(number);
        if (height <= 0)
            return;
        page_.sections.push_back(
            {design_.Section(number), top_, height, row, number == 0 && row % 2 == 1, firstAdded, added});
        top_ += height;
    }

    /// Does a record belong to the group of the one before it?
    bool SameGroup(int level, int row) const {
        for (int outer = 0; outer <= level; ++outer)
            if (sample_.GroupKey(outer, row) != sample_.GroupKey(outer, row - 1))
                return false;
        return true;
    }

    int EndOfGroup(int level, int row) const {
        ++row;
        while (row < records_ && SameGroup(level, row))
            ++row;
        return row;
    }

    void PrintGroups() {
        const int detail = Height(0);
        int details = detail < kLeastDetail ? 1 : std::clamp(kDetailHeight / detail, 1, kMostDetails);
        if (records_ > 0)
            details = std::min(details, records_);
        int levels = 0;
        for (int level = 0; level < kMostLevels; ++level)
            if (Height(5 + 2 * level) > 0 || Height(6 + 2 * level) > 0)
                levels = level + 1;
        PrintLevel(0, levels, 0, records_ < 0 ? details : records_, details);
    }

    bool BreaksPage(int number) const {
        const auto* section = design_.Section(number);
        return section != nullptr && section->Integer("ForceNewPage", 0) != 0;
    }

    /// Are so many groups of a level enough for this page?
    bool IsFull(int level, int groups, int height) const {
        const bool newPage = BreaksPage(5 + 2 * level) || BreaksPage(6 + 2 * level);
        return (groups > 0 && newPage) || (groups > 1 && height >= kGroupsHeight);
    }

    /// Groups of a level one below the other within the records [row, end), about `room` details in all.
    /// A long group is cut, so that its footer and the next group are seen.
    void PrintLevel(int level, int levels, int row, int end, int room) {
        if (level == levels) {
            for (const int last = std::min(end, row + room); row < last; ++row)
                Print(0, row);
            return;
        }
        const int share = std::max(1, room > 3 ? room / 2 : room);
        const int start = top_;
        for (int group = 0; row < end && room > 0 && !IsFull(level, group, top_ - start); ++group) {
            const int next =
                records_ < 0 ? std::min(end, row + share) : std::min(end, EndOfGroup(level, row));
            // Without records a group's sums go over sample rows.
            const int added = records_ < 0 ? 0 : next - row;
            Print(5 + 2 * level, row, row, added);
            PrintLevel(level + 1, levels, row, next, share);
            Print(6 + 2 * level, next - 1, row, added);
            room -= std::max(1, std::min(share, next - row));
            row = next;
        }
    }

    const Design& design_;
    const SampleData& sample_;
    int records_;
    const SystemMetrics& metrics_;
    ReportPage page_;
    int top_ = 0;
};

} // namespace

ReportPage PlanReportPage(const Design& design, const SampleData& sample, const SystemMetrics& metrics) {
    return Planner(design, sample, metrics).Plan();
}

std::vector<PrintedSection> PlanPrintedBody(const Design& design, const SampleData& sample,
                                            const SystemMetrics& metrics) {
    auto sections = PlanReportPage(design, sample, metrics).sections;
    // A report within a page has no pages of its own.
    const auto *header = design.Section(3), *footer = design.Section(4);
    std::erase_if(sections, [&](const PrintedSection& section) {
        return section.object == header || section.object == footer;
    });
    int top = 0;
    for (auto& section : sections) {
        section.top = top;
        top += section.height;
    }
    return sections;
}

} // namespace tovimar::platform::painting
