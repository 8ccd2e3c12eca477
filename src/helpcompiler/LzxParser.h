#pragma once

#include <array>
#include <cstdint>
#include <string_view>
#include <vector>

namespace tovimar::helpcompiler {

/// A literal, or a copy of earlier bytes of the interval.
struct LzxItem {
    std::uint16_t length = 1; ///< 1: a literal
    std::uint8_t literal = 0;
    std::uint8_t slot = 0;  ///< class of the offset; 0 to 2: one of the last three offsets
    std::uint32_t rest = 0; ///< the offset's place in its class
};

/// Bits that follow a slot, and the smallest offset (plus two) of it.
unsigned LzxExtraBits(unsigned slot);
std::uint32_t LzxSlotBase(unsigned slot);

/// Cuts an interval into items; none reaches over the end of a frame.
std::vector<LzxItem> ParseInterval(std::string_view input);

} // namespace tovimar::helpcompiler
