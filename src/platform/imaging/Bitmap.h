#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar::platform {

/// A captured picture: 32-bit pixels 0x00RRGGBB, rows from the top, no padding.
struct Bitmap {
    int width = 0;
    int height = 0;
    std::vector<std::uint32_t> pixels;

    bool Empty() const { return width <= 0 || height <= 0; }
};

/// A black picture; sides above 16384 and more than 64 million pixels are cut.
Bitmap BlackBitmap(int width, int height);

/// Windows bitmap file: 24-bit, rows from the bottom, padded to 4 bytes.
std::string EncodeBmp(const Bitmap& bitmap);

} // namespace tovimar::platform
