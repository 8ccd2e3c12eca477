#include "uimodel/HostProperty.h"

#include "platform/Error.h"

namespace tovimar::HostProperty {

namespace {

/// What `convert` makes of the property, else `absent`.
template <typename T, typename Convert>
T Converted(const HostObject& object, const char* name, T absent, Convert convert) {
    const Value value = Read(object, name);
    if (value.IsNull())
        return absent;
    try {
        return convert(value);
    } catch (const RaisedError&) {
        return absent;
    }
}

} // namespace

Value Read(const HostObject& object, const char* name, const AutomationObject::Arguments& arguments) {
    if (object == nullptr)
        return {};
    return object->Find(name, arguments).value_or(Value());
}

bool Readable(const HostObject& object, const char* name) {
    return !Read(object, name).IsNull();
}

std::int32_t Integer(const HostObject& object, const char* name, std::int32_t absent) {
    return Converted(object, name, absent, [](const Value& value) { return value.AsInteger(); });
}

double Number(const HostObject& object, const char* name, double absent) {
    return Converted(object, name, absent, [](const Value& value) { return value.AsDouble(); });
}

bool Flag(const HostObject& object, const char* name) {
    return Converted(object, name, false, [](const Value& value) { return value.AsBoolean(); });
}

std::string Text(const HostObject& object, const char* name) {
    return Converted(object, name, std::string(), [](const Value& value) { return value.AsString(); });
}

HostObject Object(const HostObject& object, const char* name, const AutomationObject::Arguments& arguments) {
    return Read(object, name, arguments).AsObject();
}

} // namespace tovimar::HostProperty
