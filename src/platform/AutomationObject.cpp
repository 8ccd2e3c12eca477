#include "platform/AutomationObject.h"

#include "platform/Error.h"

namespace tovimar {

std::optional<Value> AutomationObject::Find(std::string_view member, const Arguments& arguments) {
    try {
        return Get(member, arguments);
    } catch (const RaisedError&) {
        return std::nullopt;
    }
}

std::optional<Value> AutomationObject::FindProperty(const std::string& name) {
    try {
        const HostObject property = Get("Properties", {name}).AsObject();
        return property ? std::optional(property->Get("Value")) : std::nullopt;
    } catch (const RaisedError&) {
        return std::nullopt;
    }
}

} // namespace tovimar
