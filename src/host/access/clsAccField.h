#pragma once

#include "platform/AutomationObject.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// A field of a table or query, as an object that the form layer hands over like a control. It answers
/// `TableName`, `Name`, `Caption` (the name), `Description`, `StatusBarText` (the description), `TabIndex`
/// (its place) and `Properties` of these names.
class clsAccField : public AutomationObject {
public:
    clsAccField(std::string tableName, std::string name, std::string description, std::int32_t tabIndex);

    std::string ClassName() const override { return "Field"; }
    Value Get(std::string_view member, const Arguments& arguments = {}) override;
    void Set(std::string_view member, const Value& value) override;
    Value Call(std::string_view member, const Arguments& arguments = {}) override;

    std::string TableName;
    std::string Name;
    std::string Description;
    std::int32_t TabIndex = 0;
};

} // namespace tovimar
