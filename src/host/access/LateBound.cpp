#include "host/access/LateBound.h"

#include "platform/Error.h"

namespace tovimar::late {
namespace {

AutomationObject& Needed(const HostObject& object, std::string_view member) {
    if (!object)
        throw RaisedError(91, "Object variable not set [" + std::string(member) + "]", "Host");
    return *object;
}

/// What `convert` makes of the member, else what stands for nothing.
template <typename Result, typename Convert>
Result OrEmpty(const HostObject& object, std::string_view member, Convert convert,
               const AutomationObject::Arguments& arguments = {}) {
    const auto value = object ? object->Find(member, arguments) : std::nullopt;
    if (!value)
        return Result();
    try {
        return convert(*value);
    } catch (const RaisedError&) {
        return Result();
    }
}

} // namespace

Value Get(const HostObject& object, std::string_view member, const AutomationObject::Arguments& arguments) {
    return Needed(object, member).Get(member, arguments);
}

void Set(const HostObject& object, std::string_view member, const Value& value) {
    Needed(object, member).Set(member, value);
}

Value Call(const HostObject& object, std::string_view member, const AutomationObject::Arguments& arguments) {
    return Needed(object, member).Call(member, arguments);
}

HostObject Object(const HostObject& object, std::string_view member,
                  const AutomationObject::Arguments& arguments) {
    return Get(object, member, arguments).AsObject();
}

std::string Text(const HostObject& object, std::string_view member,
                 const AutomationObject::Arguments& arguments) {
    return Get(object, member, arguments).AsString();
}

std::int32_t Integer(const HostObject& object, std::string_view member,
                     const AutomationObject::Arguments& arguments) {
    return Get(object, member, arguments).AsInteger();
}

double Number(const HostObject& object, std::string_view member) {
    return Get(object, member).AsDouble();
}

bool Flag(const HostObject& object, std::string_view member) {
    return Get(object, member).AsBoolean();
}

Value Property(const HostObject& object, const std::string& name) {
    return Get(Object(object, "Properties", {name}), "Value");
}

Value PropertyOrNull(const HostObject& object, const std::string& name) {
    return object ? object->FindProperty(name).value_or(Value()) : Value();
}

std::int32_t IntegerOrZero(const HostObject& object, std::string_view member) {
    return OrEmpty<std::int32_t>(object, member, [](const Value& value) { return value.AsInteger(); });
}

bool FlagOrFalse(const HostObject& object, std::string_view member) {
    return OrEmpty<bool>(object, member, [](const Value& value) { return value.AsBoolean(); });
}

std::string TextOrEmpty(const HostObject& object, std::string_view member) {
    return OrEmpty<std::string>(object, member, [](const Value& value) { return value.AsString(); });
}

HostObject ObjectOrNull(const HostObject& object, std::string_view member,
                        const AutomationObject::Arguments& arguments) {
    return OrEmpty<HostObject>(
        object, member, [](const Value& value) { return value.AsObject(); }, arguments);
}

std::string ClassName(const HostObject& object) {
    return object ? object->ClassName() : std::string();
}

bool Same(const HostObject& left, const HostObject& right) {
    return left && right && left->Identity() == right->Identity();
}

std::int32_t Count(const HostObject& collection) {
    return Integer(collection, "Count");
}

HostObject Item(const HostObject& collection, const Value& indexOrName) {
    return Object(collection, "Item", {indexOrName});
}

} // namespace tovimar::late
