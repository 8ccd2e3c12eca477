#pragma once

#include "platform/access/LateBound.h"

#include <functional>
#include <string>
#include <unordered_map>
#include <vector>

namespace tovimar::platform::access {

/// What a collection raises for an entry that it doesn't have.
struct MissingEntry {
    ResultCode number = 9;
    std::string text = "Subscript out of range";
};

/// A list of objects: `Count`, `Item(position or name)`. Numeric text that is no entry's name doesn't count
/// as a position. Entries keep their identity as long as the collection lives.
class CollectionObject : public LateBound<CollectionObject> {
public:
    /// `firstPosition` is 0 for the host's and the data library's lists, 1 for the code editor's.
    CollectionObject(std::string className, int firstPosition, MissingEntry missing)
        : className_(std::move(className)), firstPosition_(firstPosition), missing_(std::move(missing)) {}

    void Add(const std::string& name, HostObject object);
    std::size_t Count() const { return objects_.size(); }
    /// Raises the collection's own error for an entry that it doesn't have.
    HostObject At(const Value& key) const;

    std::string ClassName() const override { return className_; }
    static const MemberTable<CollectionObject>& Members();

private:
    Value ReadCount(const Arguments&) { return static_cast<std::int32_t>(objects_.size()); }
    Value ReadItem(const Arguments& arguments) { return ObjectValue(At(ArgumentAt(arguments, 0))); }

    std::string className_;
    int firstPosition_;
    MissingEntry missing_;
    std::vector<HostObject> objects_;
    std::unordered_map<std::string, std::size_t> byName_;
};

/// `owner.Things` is the list, `owner.Things(key)` an entry of it.
Value ListOrItem(const std::shared_ptr<CollectionObject>& list, const AutomationObject::Arguments& arguments);

/// A property as an object: `Name` and `Value`. Writing goes to the owner.
class PropertyObject : public LateBound<PropertyObject> {
public:
    PropertyObject(std::string name, Value value) : name_(std::move(name)), value_(std::move(value)) {}
    PropertyObject(std::string name, HostObject owner) : name_(std::move(name)), owner_(std::move(owner)) {}

    std::string ClassName() const override { return "Property"; }
    static const MemberTable<PropertyObject>& Members();

private:
    Value ReadName(const Arguments&) { return name_; }
    Value ReadValue(const Arguments&) { return owner_ ? owner_->Get(name_) : value_; }
    void WriteValue(const Value& value);

    std::string name_;
    HostObject owner_;
    Value value_;
};

/// `Properties` of a form, section or control: each name that the owner answers is an entry.
class OwnerProperties : public LateBound<OwnerProperties> {
public:
    using Names = std::function<std::vector<std::string>()>;
    OwnerProperties(HostObject owner, Names names) : owner_(std::move(owner)), names_(std::move(names)) {}

    std::string ClassName() const override { return "Properties"; }
    static const MemberTable<OwnerProperties>& Members();
    /// Raises 2455 for a property that the owner doesn't have.
    Value Entry(const Value& key);

private:
    Value ReadCount(const Arguments&) { return static_cast<std::int32_t>(names_().size()); }
    Value ReadItem(const Arguments& arguments) { return Entry(ArgumentAt(arguments, 0)); }

    HostObject owner_;
    Names names_;
};

} // namespace tovimar::platform::access
