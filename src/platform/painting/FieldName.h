#pragma once

#include <string>
#include <string_view>

/// Names in control sources.
namespace tovimar::platform::painting {

/// The field that "[Orders].[Total]" or "Total" names.
std::string FieldName(std::string_view source);

/// "CarnivalTitle" as "Carnival Title".
std::string SpacedName(std::string_view name);

} // namespace tovimar::platform::painting
