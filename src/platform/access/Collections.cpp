#include "platform/access/Collections.h"

namespace tovimar::platform::access {

const MemberTable<CollectionObject>& CollectionObject::Members() {
    static const MemberTable<CollectionObject> kMembers{{"Count", &CollectionObject::ReadCount},
                                                        {"Item", &CollectionObject::ReadItem}};
    return kMembers;
}

void CollectionObject::Add(const std::string& name, HostObject object) {
    byName_.try_emplace(text::FoldCase(name), objects_.size());
    objects_.push_back(std::move(object));
}

HostObject CollectionObject::At(const Value& key) const {
    if (key.IsInteger() || key.IsDouble()) {
        const auto position = static_cast<std::int64_t>(key.AsInteger()) - firstPosition_;
        if (position >= 0 && position < static_cast<std::int64_t>(objects_.size()))
            return objects_[static_cast<std::size_t>(position)];
    } else if (const auto found = byName_.find(text::FoldCase(key.AsString())); found != byName_.end()) {
        return objects_[found->second];
    }
    const auto name = key.AsString();
    throw RaisedError(missing_.number, text::ReplaceAll(missing_.text, "|", name), className_);
}

Value ListOrItem(const std::shared_ptr<CollectionObject>& list,
                 const AutomationObject::Arguments& arguments) {
    return arguments.empty() ? ObjectValue(list) : ObjectValue(list->At(arguments[0]));
}

const MemberTable<PropertyObject>& PropertyObject::Members() {
    static const MemberTable<PropertyObject> kMembers{
        {"Name", &PropertyObject::ReadName},
        {"Value", &PropertyObject::ReadValue, &PropertyObject::WriteValue}};
    return kMembers;
}

void PropertyObject::WriteValue(const Value& value) {
    if (owner_)
        owner_->Set(name_, value);
    else
        value_ = value;
}

const MemberTable<OwnerProperties>& OwnerProperties::Members() {
    static const MemberTable<OwnerProperties> kMembers{{"Count", &OwnerProperties::ReadCount},
                                                       {"Item", &OwnerProperties::ReadItem}};
    return kMembers;
}

Value OwnerProperties::Entry(const Value& key) {
    constexpr ResultCode kInvalidProperty = 2455;
    auto name = key.AsString();
    if (key.IsInteger()) {
        const auto names = names_();
        const auto position = static_cast<std::size_t>(key.AsInteger());
        name = key.AsInteger() >= 0 && position < names.size() ? names[position] : std::string();
    }
    try {
        if (!name.empty() && !owner_->Get(name).IsObject())
            return ObjectValue(std::make_shared<PropertyObject>(name, owner_));
    } catch (const RaisedError& failure) {
        if (failure.Number() == kObjectClosed)
            throw;
    }
    throw RaisedError(kInvalidProperty,
                      "You entered an expression that has an invalid reference to the property " + name + ".",
                      owner_->ClassName());
}

} // namespace tovimar::platform::access
