#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar::platform {

/// Leaves new elements as they are: pictures are megabytes, and every pixel is written right after.
template <typename T> struct UninitializedAllocator : std::allocator<T> {
    template <typename U> struct rebind { using other = UninitializedAllocator<U>; };
    template <typename U> void construct(U* place) noexcept { ::new (static_cast<void*>(place)) U; }
    template <typename U, typename... Arguments> void construct(U* place, Arguments&&... arguments) {
        std::construct_at(place, std::forward<Arguments>(arguments)...);
    }
};

using Pixels = std::vector<std::uint32_t, UninitializedAllocator<std::uint32_t>>;

/// A captured picture: 32-bit pixels 0x00RRGGBB, rows from the top, no padding.
struct Bitmap {
    int width = 0;
    int height = 0;
    /// A resize leaves new pixels unset.
    Pixels pixels;

    bool Empty() const { return width <= 0 || height <= 0; }
};

/// A black picture; sides above 16384 and more than 64 million pixels are cut.
Bitmap BlackBitmap(int width, int height);

/// Windows bitmap file: 24-bit, rows from the bottom, padded to 4 bytes.
std::string EncodeBmp(const Bitmap& bitmap);

} // namespace tovimar::platform
