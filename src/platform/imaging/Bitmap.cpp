#include "platform/imaging/Bitmap.h"

#include <algorithm>
#include <cstddef>

namespace tovimar::platform {

namespace {

/// Sizes come from definitions, which may be damaged.
constexpr int kLargestSide = 16384;
constexpr int kMostPixels = 64'000'000;
constexpr std::size_t kFileHeader = 14;
constexpr std::size_t kInfoHeader = 40;
/// 96 dots an inch in dots a metre.
constexpr std::uint32_t kDotsPerMetre = 3780;

void Put16(std::string& out, std::uint32_t value) {
    out.push_back(static_cast<char>(value & 0xFFU));
    out.push_back(static_cast<char>((value >> 8U) & 0xFFU));
}

void Put32(std::string& out, std::uint32_t value) {
    Put16(out, value & 0xFFFFU);
    Put16(out, value >> 16U);
}

} // namespace

Bitmap BlackBitmap(int width, int height) {
    Bitmap bitmap;
    bitmap.width = std::clamp(width, 0, kLargestSide);
    bitmap.height = std::clamp(height, 0, std::min(kLargestSide, kMostPixels / std::max(1, bitmap.width)));
    bitmap.pixels.assign(static_cast<std::size_t>(bitmap.width) * static_cast<std::size_t>(bitmap.height), 0);
    return bitmap;
}

std::string EncodeBmp(const Bitmap& bitmap) {
    const std::size_t width = bitmap.Empty() ? 0 : static_cast<std::size_t>(bitmap.width);
    const std::size_t height = bitmap.Empty() ? 0 : static_cast<std::size_t>(bitmap.height);
    const std::size_t line = (width * 3 + 3) & ~std::size_t{3};
    std::string out;
    out.reserve(kFileHeader + kInfoHeader + line * height);
    out += "BM";
    Put32(out, static_cast<std::uint32_t>(kFileHeader + kInfoHeader + line * height));
    Put32(out, 0);
    Put32(out, kFileHeader + kInfoHeader);
    Put32(out, kInfoHeader);
    Put32(out, static_cast<std::uint32_t>(width));
    Put32(out, static_cast<std::uint32_t>(height));
    Put16(out, 1);
    Put16(out, 24);
    Put32(out, 0);
    Put32(out, static_cast<std::uint32_t>(line * height));
    Put32(out, kDotsPerMetre);
    Put32(out, kDotsPerMetre);
    Put32(out, 0);
    Put32(out, 0);

    out.resize(kFileHeader + kInfoHeader + line * height);
    char* target = out.data() + kFileHeader + kInfoHeader;
    for (std::size_t y = height; y-- > 0; target += line) {
        const std::uint32_t* source = bitmap.pixels.data() + y * width;
        for (std::size_t x = 0; x < width; ++x) {
            target[3 * x] = static_cast<char>(source[x] & 0xFFU);
            target[3 * x + 1] = static_cast<char>((source[x] >> 8U) & 0xFFU);
            target[3 * x + 2] = static_cast<char>((source[x] >> 16U) & 0xFFU);
        }
    }
    return out;
}

} // namespace tovimar::platform
