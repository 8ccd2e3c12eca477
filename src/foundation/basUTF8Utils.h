#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace tovimar {

/// Well-formed UTF-8 whatever the text held.
std::vector<std::uint8_t> StringToUTF8(const std::string& text);
/// Ill-formed bytes become U+FFFD.
std::string UTF8ToString(const std::vector<std::uint8_t>& bytes);

} // namespace tovimar
