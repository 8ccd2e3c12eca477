#pragma once

#include <functional>
#include <optional>
#include <string>
#include <string_view>

/// What control sources that begin with "=" show. Nothing is computed: what joins texts is joined, the rest
/// is told apart by its functions.
namespace tovimar::platform::painting {

/// The field that "[Orders].[Total]" or "Total" names.
std::string FieldName(std::string_view source);

/// Literals, fields, dates and page numbers joined as the expression joins them; none when it does more.
std::optional<std::string>
JoinExpression(std::string_view expression,
               const std::function<std::string(std::string_view field)>& fieldText);

/// Does the expression give a number of many records ("Sum", "Count", ...)?
bool IsAggregate(std::string_view expression);

/// The field of DLookup("[Title]","Settings"), whose name says what it holds; empty for other expressions.
std::string LookedUpField(std::string_view expression);

/// "CarnivalTitle" as "Carnival Title".
std::string SpacedName(std::string_view name);

} // namespace tovimar::platform::painting
