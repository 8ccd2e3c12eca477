#pragma once

#include <string>
#include <string_view>

/// Believable contents for controls whose data isn't at hand. Rows differ; nothing depends on the clock.
namespace tovimar::platform::painting {

enum class SampleKind { Text, Number, Money, Date, Boolean };

/// What a field is by its display format and its name.
SampleKind KindOf(std::string_view format, std::string_view fieldName);

/// Is there sample text that fits a field of that name?
bool HasSampleWords(std::string_view fieldName);

/// Does the name tell what such a field holds?
bool SaysItsKind(std::string_view fieldName);

/// Content of a field in the row `row` (from 0), without its format. Empty for a text of which nothing is
/// known: an empty box is what the host shows for a new record.
std::string SampleText(SampleKind kind, std::string_view format, std::string_view fieldName, int row);

} // namespace tovimar::platform::painting
