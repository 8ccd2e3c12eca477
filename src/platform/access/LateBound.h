#pragma once

#include "platform/AutomationObject.h"
#include "platform/Error.h"
#include "platform/text/Caseless.h"
#include "platform/text/Text.h"

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>

/// Late-bound objects by tables of members: a member's folded name finds the functions that read and write
/// it. A method is read like a property, as the automation rules allow.
namespace tovimar::platform::access {

inline constexpr ResultCode kNoSuchMember = 438;
inline constexpr ResultCode kObjectClosed = 2467;

[[noreturn]] inline void RaiseNoSuchMember(const std::string& source) {
    throw RaisedError(kNoSuchMember, "Object doesn't support this property or method", source);
}

[[noreturn]] inline void RaiseObjectClosed(const std::string& source) {
    throw RaisedError(kObjectClosed,
                      "The expression you entered refers to an object that is closed or doesn't exist.",
                      source);
}

template <class T> struct Member {
    using Arguments = AutomationObject::Arguments;
    std::string_view name; ///< as the host spells it
    Value (T::*read)(const Arguments&) = nullptr;
    void (T::*write)(const Value&) = nullptr;
};

template <class T> class MemberTable {
public:
    MemberTable(std::initializer_list<Member<T>> members) {
        for (const auto& member : members)
            members_.emplace(member.name, member);
    }
    const Member<T>* Find(std::string_view name) const {
        const auto found = members_.find(name);
        return found == members_.end() ? nullptr : &found->second;
    }

private:
    std::unordered_map<std::string_view, Member<T>, text::CaselessHash, text::CaselessEqual> members_;
};

/// T gives its table as `static const MemberTable<T>& Members()`. Names outside of the table go to
/// `FindOther` and `WriteOther`; reading one that isn't found raises 438.
template <class T> class LateBound : public AutomationObject {
public:
    Value Get(std::string_view name, const Arguments& arguments = {}) override {
        const auto* member = T::Members().Find(name);
        if (!member || !member->read)
            return ReadOther(name, arguments);
        return (static_cast<T*>(this)->*member->read)(arguments);
    }
    std::optional<Value> Find(std::string_view name, const Arguments& arguments = {}) override {
        const auto* member = T::Members().Find(name);
        if (member && member->read)
            return AutomationObject::Find(name, arguments);
        try {
            return FindOther(name, arguments);
        } catch (const RaisedError&) {
            return std::nullopt; // a closed object
        }
    }
    void Set(std::string_view name, const Value& value) override {
        const auto* member = T::Members().Find(name);
        if (member && member->write)
            (static_cast<T*>(this)->*member->write)(value);
        else
            WriteOther(name, value);
    }
    Value Call(std::string_view name, const Arguments& arguments = {}) override {
        return Get(name, arguments);
    }

protected:
    Value ReadOther(std::string_view name, const Arguments& arguments) {
        auto value = FindOther(name, arguments);
        if (!value)
            RaiseNoSuchMember(ClassName());
        return std::move(*value);
    }
    virtual std::optional<Value> FindOther(std::string_view, const Arguments&) { return std::nullopt; }
    virtual void WriteOther(std::string_view, const Value&) { RaiseNoSuchMember(ClassName()); }
};

/// Argument by position; null when it is left out.
inline Value ArgumentAt(const AutomationObject::Arguments& arguments, std::size_t index) {
    return index < arguments.size() ? arguments[index] : Value();
}
inline std::int32_t IntegerAt(const AutomationObject::Arguments& arguments, std::size_t index,
                              std::int32_t absent = 0) {
    const auto value = ArgumentAt(arguments, index);
    return value.IsNull() ? absent : value.AsInteger();
}
inline std::string TextAt(const AutomationObject::Arguments& arguments, std::size_t index) {
    return ArgumentAt(arguments, index).AsString();
}

inline Value ObjectValue(HostObject object) {
    return Value(std::move(object));
}

} // namespace tovimar::platform::access
