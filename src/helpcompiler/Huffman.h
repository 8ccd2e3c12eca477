#pragma once

#include <cstdint>
#include <span>
#include <vector>

namespace tovimar::helpcompiler {

/// Lengths in bits of the shortest codes for symbols of these frequencies, none longer than `longest`; 0 for
/// a symbol that doesn't occur. The code is complete: a lone symbol gets a partner that is never used, and no
/// symbols at all no code.
std::vector<std::uint8_t> CodeLengths(std::span<const std::uint32_t> frequencies, unsigned longest);

/// The codes of these lengths, in the order of length and symbol.
std::vector<std::uint16_t> CanonicalCodes(std::span<const std::uint8_t> lengths);

} // namespace tovimar::helpcompiler
