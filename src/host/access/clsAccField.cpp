#include "host/access/clsAccField.h"

#include "platform/Error.h"
#include "platform/text/Text.h"

#include <memory>

namespace tovimar {
namespace {

[[noreturn]] void RaiseNoMember(std::string_view member) {
    throw RaisedError(438, "Object doesn't support this property or method [" + std::string(member) + "]",
                      "clsAccField");
}

/// One property, for callers that read `Properties(name).Value`; without a name the list of them.
class FieldProperties : public AutomationObject {
public:
    FieldProperties(std::shared_ptr<AutomationObject> field, std::string name)
        : field_(std::move(field)), name_(std::move(name)) {}

    std::string ClassName() const override { return name_.empty() ? "Properties" : "Property"; }
    Value Get(std::string_view member, const Arguments& arguments) override {
        if (!name_.empty() && text::EqualsIgnoringCase(member, "Value"))
            return field_->Get(name_);
        if (!name_.empty() && text::EqualsIgnoringCase(member, "Name"))
            return name_;
        if (text::EqualsIgnoringCase(member, "Item") && arguments.size() == 1)
            return field_->Get("Properties", arguments);
        RaiseNoMember(member);
    }
    void Set(std::string_view member, const Value&) override { RaiseNoMember(member); }
    Value Call(std::string_view member, const Arguments& arguments) override {
        return Get(member, arguments);
    }

private:
    std::shared_ptr<AutomationObject> field_;
    std::string name_;
};

} // namespace

clsAccField::clsAccField(std::string tableName, std::string name, std::string description,
                         std::int32_t tabIndex)
    : TableName(std::move(tableName)), Name(std::move(name)), Description(std::move(description)),
      TabIndex(tabIndex) {}

Value clsAccField::Get(std::string_view member, const Arguments& arguments) {
    const auto is = [member](const char* name) { return text::EqualsIgnoringCase(member, name); };
    if (is("Name") || is("Caption"))
        return Name;
    if (is("Description") || is("StatusBarText"))
        return Description;
    if (is("TabIndex"))
        return TabIndex;
    if (is("TableName"))
        return TableName;
    if (is("Properties")) {
        if (arguments.empty())
            return HostObject(std::make_shared<FieldProperties>(shared_from_this(), std::string()));
        const std::string name = arguments[0].AsString();
        Get(name); // an unknown property fails here, as the host's do
        return HostObject(std::make_shared<FieldProperties>(shared_from_this(), name));
    }
    RaiseNoMember(member);
}

void clsAccField::Set(std::string_view member, const Value&) {
    RaiseNoMember(member);
}

Value clsAccField::Call(std::string_view member, const Arguments&) {
    RaiseNoMember(member);
}

} // namespace tovimar
