#pragma once

#include "platform/access/Expression.h"
#include "platform/access/OpenObject.h"

#include <string>
#include <string_view>
#include <vector>

/// What the controls of one object show: the first records where they are at hand, else sample text.
namespace tovimar::platform::painting {

/// A subform shows the records whose field holds a value of the record around it.
struct RecordLink {
    std::string field;
    std::string value;
};

/// Objects and controls that ask for each other's values go so deep.
inline constexpr int kDeepestSample = 4;

class SampleData {
public:
    /// `application` may be null. Links that no record fulfils leave a subreport without records; a subform
    /// shows all then, since the wrong records tell more than none. `depth` counts the objects that ask for
    /// each other's values.
    SampleData(const access::Design& design, access::ApplicationSource* application,
               const std::vector<RecordLink>& links = {}, int depth = 0);

    /// Number of records at hand (at most `kMostRecords`), -1 when they can't be had.
    int RecordCount() const;
    access::ApplicationSource* Application() const { return application_; }
    int Depth() const { return depth_; }
    /// Aggregates go over `count` records from `first` on, over all with a count of 0.
    void LimitAggregates(int first, int count);
    /// The text that tells the groups of a report apart at a level from 0; empty without a group there.
    std::string GroupKey(int level, int row) const;
    /// Values of the fields that link a subform's records to this one's; none when one isn't known.
    std::vector<RecordLink> LinksOf(const access::DesignObject& subform, int row) const;
    /// Text of a text box, combo box or label bound to something, in the record `row` (from 0).
    std::string Text(const access::DesignObject& control, int row) const;
    /// State of a check box, option button or toggle button.
    bool Checked(const access::DesignObject& control, int row) const;
    /// The option that a group shows as chosen.
    std::string GroupValue(const access::DesignObject& group, int row) const;
    /// Is the content set to the right where the design leaves that to the host?
    bool AlignsRight(const access::DesignObject& control, int row) const;
    /// Rows of a list, each cut to the columns shown; the first one is the heads where the list has them.
    struct List {
        std::vector<std::vector<std::string>> rows;
        std::vector<int> widths; ///< twips of each column, -1 where the host divides the space
        bool heads = false;
    };
    List ListRows(const access::DesignObject& control) const;

    static constexpr int kMostRecords = 1000;

private:
    class Scope;

    /// The record's value; none where the records or the field aren't at hand.
    std::optional<access::Datum> FieldValue(std::string_view field, int row) const;
    /// Sample text for a field that isn't at hand.
    access::Datum Guess(const access::DesignObject& control, std::string_view field, int row) const;
    access::Datum ValueOf(const access::DesignObject& control, int row) const;
    access::Datum Calculated(const access::DesignObject& control, std::string_view expression, int row) const;
    std::string LookedUp(const access::DesignObject& combo, const std::string& value) const;
    std::optional<std::string> Offered(const access::DesignObject& combo, int row) const;
    const access::Records* RowSource(const access::DesignObject& control) const;
    const std::vector<std::string>* ListRow(const access::DesignObject& list, const std::string& value) const;
    const access::DesignObject* FindControl(std::string_view name) const;
    void KeepLinked(const std::vector<RecordLink>& links);
    void FindGroups();
    void SortByGroups();
    int FirstOfGroup(int row) const;
    std::optional<access::Datum> LinkValue(const access::DesignObject& control, int row) const;
    access::Datum RunningSum(const access::DesignObject& control, std::string_view source, int row) const;

    const access::Design& design_;
    access::ApplicationSource* application_;
    const access::Records* records_ = nullptr;
    std::vector<int> rows_; ///< numbers of the records shown, in their order
    /// Levels of a report by their order.
    struct Group {
        int column = -1; ///< -1 where the level isn't a field's
        bool descending = false;
        bool printed = false; ///< has a header or footer
    };
    std::vector<Group> groups_;
    bool noneLinked_ = false;
    int firstAdded_ = 0, added_ = 0;
    int depth_;
    mutable int asked_ = 0; ///< controls that are asking for each other's values
};

} // namespace tovimar::platform::painting
