#include "platform/imaging/PictureSize.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace tovimar::platform {

namespace {

constexpr std::int64_t kLargest = 0x7FFFFFFF;

unsigned Byte(std::string_view bytes, std::size_t at) {
    return static_cast<unsigned char>(bytes[at]);
}

int LittleEndian32(std::string_view bytes, std::size_t at) {
    return static_cast<int>(Byte(bytes, at) | Byte(bytes, at + 1) << 8U | Byte(bytes, at + 2) << 16U |
                            Byte(bytes, at + 3) << 24U);
}

unsigned BigEndian16(std::string_view bytes, std::size_t at) {
    return Byte(bytes, at) << 8U | Byte(bytes, at + 1);
}

/// A start of frame is any of FFC0 to FFCF but the tables FFC4, FFC8 and FFCC.
bool IsFrame(unsigned marker) {
    return marker >= 0xC0 && marker <= 0xCF && marker != 0xC4 && marker != 0xC8 && marker != 0xCC;
}

} // namespace

std::optional<std::pair<int, int>> PictureSize(std::string_view bytes) {
    if (bytes.starts_with("BM") && bytes.size() >= 26) {
        // A negative height only says that the rows run from the top.
        const std::int64_t height = LittleEndian32(bytes, 22);
        return std::pair(LittleEndian32(bytes, 18), static_cast<int>(std::min(std::abs(height), kLargest)));
    }
    if (!bytes.starts_with("\xFF\xD8"))
        return std::nullopt;
    // Segments follow each other: marker, length with its own two bytes, content.
    for (std::size_t at = 2; at + 9 <= bytes.size() && Byte(bytes, at) == 0xFF;) {
        if (IsFrame(Byte(bytes, at + 1)))
            return std::pair(static_cast<int>(BigEndian16(bytes, at + 7)),
                             static_cast<int>(BigEndian16(bytes, at + 5)));
        at += 2 + BigEndian16(bytes, at + 2);
    }
    return std::nullopt;
}

} // namespace tovimar::platform
