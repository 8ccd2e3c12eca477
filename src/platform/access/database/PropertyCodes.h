#pragma once

#include "platform/access/database/DesignBlob.h"

#include <cstdint>
#include <string>
#include <string_view>

/// The numbers of objects and properties in a database's designs, and their names in text exports.
/// Measured on designs of several hundred forms and reports: a slot of a kind of object always had the
/// same code, and a code always the same kind of value.
namespace tovimar::platform::access {

/// "Label", "TextBox", ...; "Object<number>" for a kind that isn't known.
std::string ObjectTypeName(std::uint16_t type);
/// 0xFFFF for a name that isn't known.
std::uint16_t ObjectTypeNumber(std::string_view name);

/// Name in text exports; "Unknown<code>" for a property that isn't known.
std::string PropertyName(std::uint16_t code);
bool IsKnownProperty(std::uint16_t code);
/// How a property's value is kept; binary where it isn't known.
ValueKind TypeOfCode(std::uint16_t code);
/// The code of a slot below 253, for designs that keep no codes; kUnknownCode for an unknown one.
std::uint16_t CodeOfSlot(std::uint16_t objectType, std::uint32_t slot);

} // namespace tovimar::platform::access
