#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

/// Reads a design library's theme: a zip file that holds "theme/theme/theme1.xml".
namespace tovimar::platform::access {

/// Text, background, text 2, background 2, accents 1 to 6, link, visited link, each 0x00RRGGBB. Empty for a
/// file that can't be read as a theme. Nothing larger than a few megabytes is unpacked.
std::vector<std::uint32_t> ReadThemeColors(std::string_view bytes);

} // namespace tovimar::platform::access
