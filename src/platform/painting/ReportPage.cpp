#include "platform/painting/ReportPage.h"

#include "platform/painting/ObjectLayout.h"
#include "platform/painting/PageSetup.h"
#include "platform/painting/PrintedGrowth.h"
#include "platform/painting/SampleData.h"

#include <algorithm>
#include <array>

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
/// Groups of so few records are printed whole.
constexpr int kShortGroup = 8;
/// Columns filled one after the other end here, or below two details.
constexpr int kColumnHeight = 420;

class Planner {
public:
    Planner(const Design& design, const SampleData& sample, const SystemMetrics& metrics)
        : design_(design), sample_(sample), records_(sample.RecordCount()), metrics_(metrics),
          setup_(PageSetupOf(design, metrics)) {}

    ReportPage Plan() {
        page_.left = setup_.left;
        bodyWidth_ = PixelsOf(*design_.root, "Width", metrics_.twipsPerPixelX);
        page_.width = setup_.left + std::max(bodyWidth_, setup_.BodyWidth()) + setup_.right;
        top_ = setup_.top;
        Print(1, 0);
        Print(3, 0);
        PrintBody();
        Print(2, 0);
        const int below = top_ + Height(4) + setup_.bottom;
        // A sheet broader than a postcard looks like paper even when little is printed on it.
        page_.height = std::max(below, page_.width * 5 / 8);
        top_ = page_.height - setup_.bottom - Height(4);
        Print(4, 0);
        return page_;
    }

    std::vector<PrintedSection> PlanWithin() {
        bodyWidth_ = PixelsOf(*design_.root, "Width", metrics_.twipsPerPixelX);
        if (records_ == 0)
            return {};
        Print(1, 0);
        PrintBody();
        Print(2, 0);
        return page_.sections;
    }

private:
    int Height(int number) const {
        const auto* section = design_.Section(number);
        if (section == nullptr || !IsSectionShown(design_, {number, section}, View::Preview))
            return 0;
        return PixelsOf(*section, "Height", metrics_.twipsPerPixelY);
    }

    PrintedSection Planned(int number, int row, int firstAdded, int added) const {
        PrintedSection section;
        section.object = design_.Section(number);
        section.height = Height(number);
        section.left = number > 4 || number == 0 ? setup_.ColumnLeft(column_) : 0;
        section.width = number > 4 || number == 0 ? setup_.columnWidth : bodyWidth_;
        section.row = row;
        section.alternate = number == 0 && row % 2 == 1;
        section.firstAdded = firstAdded;
        section.added = added;
        if (section.height > 0)
            section.growth = GrowthOf(*section.object, sample_, row, metrics_);
        section.height += section.growth;
        return section;
    }

    void Print(int number, int row, int firstAdded = 0, int added = 0) {
        const bool flows = setup_.columns > 1 && (number > 4 || number == 0);
        if (Height(number) <= 0)
            return;
        if (flows && setup_.across && number != 0)
            EndRow();
        auto section = Planned(number, row, firstAdded, added);
        if (flows && !setup_.across)
            section.left = NextColumn(section.height);
        section.top = top_;
        page_.sections.push_back(section);
        used_ += section.height;
        if (flows && setup_.across && number == 0) {
            rowHeight_ = std::max(rowHeight_, section.height);
            if (++column_ == setup_.columns)
                EndRow();
        } else
            top_ += section.height;
    }

    /// Where the records run along rows.
    void EndRow() {
        top_ += rowHeight_;
        rowHeight_ = column_ = 0;
    }

    /// Where they run down columns: what doesn't fit goes on top of the next one.
    int NextColumn(int height) {
        const int most = std::max(kColumnHeight, 2 * Height(0));
        if (column_ + 1 < setup_.columns && top_ > bodyTop_ && top_ + height > bodyTop_ + most) {
            bottom_ = std::max(bottom_, top_);
            top_ = bodyTop_;
            ++column_;
        }
        return setup_.ColumnLeft(column_);
    }

    void PrintBody() {
        bodyTop_ = top_;
        PrintGroups();
        EndRow();
        top_ = std::max(top_, bottom_);
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

    int DetailRoom() const {
        const bool down = setup_.columns > 1 && !setup_.across;
        return down ? std::max(kColumnHeight, 2 * Height(0)) : kDetailHeight;
    }

    void PrintGroups() {
        const int detail = Height(0);
        int details =
            detail < kLeastDetail ? 1 : std::clamp(DetailRoom() / detail, 1, kMostDetails) * setup_.columns;
        if (records_ > 0)
            details = std::min(details, records_);
        int levels = 0;
        for (int level = 0; level < kMostLevels; ++level)
            if (Height(5 + 2 * level) > 0 || Height(6 + 2 * level) > 0 || LevelBreaks(level))
                levels = level + 1;
        PrintLevel(0, levels, 0, records_ < 0 ? details : records_, details);
    }

    bool BreaksPage(int number) const {
        const auto* section = design_.Section(number);
        return section != nullptr && section->Integer("ForceNewPage", 0) != 0;
    }

    bool LevelBreaks(int level) const { return BreaksPage(5 + 2 * level) || BreaksPage(6 + 2 * level); }

    /// Does the next group begin another page, or are so many groups enough for this one?
    bool IsFull(int level, int groups, int height) {
        full_ = full_ || (begun_[static_cast<std::size_t>(level)] && LevelBreaks(level));
        return full_ || (groups > 1 && height >= kGroupsHeight * setup_.columns);
    }

    /// Details that a group gets: room is left for the next one, unless that comes on another page.
    int ShareOf(int level, int levels, int room) const {
        for (int inner = level; inner < levels; ++inner)
            if (LevelBreaks(inner))
                return room;
        return std::max(1, room > 3 ? room / 2 : room);
    }

    /// Groups of a level one below the other within the records [row, end), about `room` details in all.
    /// A long group is cut, so that its footer and the next group are seen.
    void PrintLevel(int level, int levels, int row, int end, int room) {
        if (level == levels) {
            for (const int last = std::min(end, row + room); row < last; ++row)
                Print(0, row);
            return;
        }
        const int start = used_;
        for (int group = 0; row < end && room > 0 && !IsFull(level, group, used_ - start); ++group) {
            int share = ShareOf(level, levels, room);
            begun_[static_cast<std::size_t>(level)] = true;
            const int next =
                records_ < 0 ? std::min(end, row + share) : std::min(end, EndOfGroup(level, row));
            if (records_ > 0 && next - row <= kShortGroup)
                share = std::max(share, next - row);
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
    const PageSetup setup_;
    ReportPage page_;
    bool full_ = false;
    std::array<bool, kMostLevels> begun_{}; ///< levels of which a group is on the page
    int bodyWidth_ = 0;
    int top_ = 0;
    int used_ = 0; ///< height of all that is printed
    int column_ = 0, rowHeight_ = 0;
    int bodyTop_ = 0, bottom_ = 0; ///< of the columns
};

} // namespace

ReportPage PlanReportPage(const Design& design, const SampleData& sample, const SystemMetrics& metrics) {
    return Planner(design, sample, metrics).Plan();
}

std::vector<PrintedSection> PlanPrintedBody(const Design& design, const SampleData& sample,
                                            const SystemMetrics& metrics) {
    return Planner(design, sample, metrics).PlanWithin();
}

} // namespace tovimar::platform::painting
