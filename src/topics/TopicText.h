#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>

/// Searching and replacing of tags, markers and elements in pages. Needles are ASCII and compared without
/// regard to the case of ASCII letters; each operation is one pass over the page.
namespace tovimar {

/// Byte position at or behind `from`; npos when absent.
std::size_t FindAscii(std::string_view text, std::string_view needle, std::size_t from = 0);
/// Either kind around an attribute's value.
constexpr bool IsQuote(char c) {
    return c == '"' || c == '\'';
}
bool EqualsAscii(std::string_view left, std::string_view right);
bool StartsWithAscii(std::string_view text, std::string_view prefix);

/// Replaces every occurrence; replaced text isn't searched again.
void ReplaceTag(std::string& page, std::string_view tag, std::string_view value);
/// The same with a value that is only made when the tag is there.
void ReplaceTagWith(std::string& page, std::string_view tag, const std::function<std::string()>& value);

/// Cuts from the first `opening` through the first `closing`, both included, when both are there and the
/// closing one stands behind the opening one.
void CutRegion(std::string& page, std::string_view opening, std::string_view closing);

/// The text between the first `opening` and the first `closing` behind it; null data when there is none.
std::string_view Between(std::string_view page, std::string_view opening, std::string_view closing);

/// Takes CRLF line ends out.
std::string WithoutLineEnds(std::string_view text);

} // namespace tovimar
