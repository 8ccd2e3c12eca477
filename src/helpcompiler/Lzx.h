#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

/// The compression of a compiled help. Its input is cut into intervals that know nothing of each other, and
/// these into frames, which readers jump to.
namespace tovimar::helpcompiler {

constexpr std::size_t kLzxFrame = 0x8000;
constexpr std::size_t kLzxInterval = 2 * kLzxFrame;

struct LzxInterval {
    std::string bytes;
    /// Where each frame ends in `bytes`.
    std::array<std::uint32_t, 2> frameEnds{};
    std::size_t frames = 0;
};

/// What a caller knows of the bytes: those of pictures are packed already, and only glanced at.
enum class Expect { Anything, Packed };

/// One interval, of one or two whole frames. Anything else is a fault of the caller.
LzxInterval CompressInterval(std::string_view input, Expect expect = Expect::Anything);

} // namespace tovimar::helpcompiler
