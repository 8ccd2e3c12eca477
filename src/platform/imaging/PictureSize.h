#pragma once

#include <optional>
#include <string_view>
#include <utility>

namespace tovimar::platform {

/// Width and height in pixels of a BMP or JPEG file, read from its headers alone; none for other bytes.
std::optional<std::pair<int, int>> PictureSize(std::string_view bytes);

} // namespace tovimar::platform
