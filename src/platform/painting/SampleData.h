#pragma once

#include "platform/access/OpenObject.h"

#include <string>
#include <string_view>
#include <vector>

/// What the controls of one object show: the first records where they are at hand, else sample text.
namespace tovimar::platform::painting {

class SampleData {
public:
    /// `application` may be null.
    SampleData(const access::Design& design, access::ApplicationSource* application);

    /// Number of records at hand (at most `kMostRecords`), -1 when they can't be had.
    int RecordCount() const;
    /// Text of a text box, combo box or label bound to something, in the record `row` (from 0).
    std::string Text(const access::DesignObject& control, int row) const;
    /// State of a check box, option button or toggle button.
    bool Checked(const access::DesignObject& control, int row) const;
    /// The option that a group shows as chosen.
    std::string GroupValue(const access::DesignObject& group, int row) const;
    /// Is the content set to the right where the design leaves that to the host?
    bool AlignsRight(const access::DesignObject& control) const;
    /// Rows of a list, each cut to the columns shown; the first one is the heads where the list has them.
    struct List {
        std::vector<std::vector<std::string>> rows;
        std::vector<int> widths; ///< twips of each column, -1 where the host divides the space
        bool heads = false;
    };
    List ListRows(const access::DesignObject& control) const;

    static constexpr int kMostRecords = 25;

private:
    std::string FieldText(const access::DesignObject& control, std::string_view field, int row) const;
    std::string Expression(const access::DesignObject& control, std::string_view expression, int row) const;
    std::string LookedUp(const access::DesignObject& combo, const std::string& value, int row) const;
    const access::Records* RowSource(const access::DesignObject& control) const;

    access::ApplicationSource* application_;
    const access::Records* records_ = nullptr;
};

} // namespace tovimar::platform::painting
