#pragma once

#include <string>
#include <string_view>

namespace tovimar::search {

/// Deflated without a header, as a browser inflates "deflate-raw", then five characters for four bytes:
/// characters from "!" on without those that a script's string or a page would read as its own
/// (kPackingLetters), the highest digit first. The last group may be short: n bytes give n + 1 characters.
std::string Pack(std::string_view text);

/// The digits 0 to 84.
extern const std::string_view kPackingLetters;

} // namespace tovimar::search
