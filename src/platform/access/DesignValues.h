#pragma once

#include "platform/Value.h"
#include "platform/access/Design.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

/// The design as the object model shows it: class names, type numbers and late-bound property values.
namespace tovimar::platform::access {

/// A built-in default with the property's name as the host spells it.
struct DefaultEntry {
    std::string name;
    std::string value;
};
/// By folded property name; empty for kinds without properties of their own.
using DefaultTable = std::unordered_map<std::string, DefaultEntry, text::CaselessHash, text::CaselessEqual>;
const DefaultTable& BuiltInDefaults(std::string_view type);

/// The host's class name of a control kind: "Tab" is a "TabControl", "Subform" a "SubForm", ...
std::string ControlClassName(std::string_view type);
/// The host's ControlType, 0 for a kind that has none.
std::int32_t ControlTypeNumber(std::string_view type);

/// A property's value in effect; none when the object has no such property. Flags are Booleans, whole
/// numbers integers, other numbers doubles. "BorderStyle" of a control stands as "OldBorderStyle" in exports.
std::optional<Value> EffectiveValue(const DesignObject& object, std::string_view property);
/// Names of all properties that EffectiveValue knows, sorted.
std::vector<std::string> PropertyNames(const DesignObject& object);

} // namespace tovimar::platform::access
