#pragma once

#include "platform/painting/SampleData.h"

namespace tovimar::platform::painting {

/// What expressions of an object's controls find around them: fields, other controls, columns of lists, the
/// object within a subform, records of other tables. Lives as long as one value is asked for.
class SampleData::Scope : public access::ExpressionScope {
public:
    Scope(const SampleData& data, const access::DesignObject& control) : data_(data), control_(control) {}

    std::optional<access::Datum> Value(const access::NamePath& name, int row) const override;
    int Rows() const override;
    int FirstRow() const override { return data_.firstAdded_; }
    std::optional<access::Datum> LookUp(const std::string& function, const std::string& expression,
                                        const std::string& domain,
                                        const std::string& condition) const override;

private:
    std::optional<access::Datum> Named(const std::string& name, int row) const;
    /// "[Lines].[Form]![Total]": a control of the object that a subform shows.
    std::optional<access::Datum> InSubform(const access::NamePath& name) const;
    /// A column, counted from 0, of the row that a combo box shows.
    std::optional<access::Datum> InList(const std::string& combo, const std::string& column, int row) const;

    const SampleData& data_;
    const access::DesignObject& control_;
};

} // namespace tovimar::platform::painting
