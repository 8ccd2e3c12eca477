#pragma once

#include "platform/imaging/Bitmap.h"

#include <cstdint>
#include <string>
#include <string_view>

namespace tovimar::platform {

/// Result codes of the JPEG writer, as its callers' table of texts counts them.
namespace JpegCode {
inline constexpr int kOk = 0;
inline constexpr int kException = -1;
inline constexpr int kMemoryError = -5;
inline constexpr int kInvalidProperties = -8;
inline constexpr int kNoImage = -22;
inline constexpr int kFileError = -23;
} // namespace JpegCode

/// A 24-bit section: bytes blue, green, red, rows of `bytesPerLine` from the bottom.
struct DibSection {
    const std::uint8_t* bits = nullptr;
    int width = 0;
    int height = 0;
    int bytesPerLine = 0;
};

/// Compresses at `quality` 1 to 100; a code of `JpegCode`.
int EncodeJpeg(const DibSection& section, int quality, std::string& out);
int EncodeJpeg(const Bitmap& bitmap, int quality, std::string& out);

} // namespace tovimar::platform
