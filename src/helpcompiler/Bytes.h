#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

/// Numbers of the compiled help: little-endian, of fixed size or seven bits a byte.
namespace tovimar::helpcompiler {

inline void PutU16(std::string& out, std::uint32_t number) {
    out.push_back(static_cast<char>(number & 0xFFU));
    out.push_back(static_cast<char>(number >> 8 & 0xFFU));
}

inline void PutU32(std::string& out, std::uint32_t number) {
    PutU16(out, number & 0xFFFFU);
    PutU16(out, number >> 16);
}

inline void PutU64(std::string& out, std::uint64_t number) {
    PutU32(out, static_cast<std::uint32_t>(number & 0xFFFFFFFFU));
    PutU32(out, static_cast<std::uint32_t>(number >> 32));
}

/// Over what stands at `offset`, which must lie inside.
inline void SetU16(std::string& out, std::size_t offset, std::uint32_t number) {
    for (std::size_t i = 0; i < 2; ++i)
        out[offset + i] = static_cast<char>(number >> 8 * i & 0xFFU);
}

inline void SetU32(std::string& out, std::size_t offset, std::uint32_t number) {
    for (std::size_t i = 0; i < 4; ++i)
        out[offset + i] = static_cast<char>(number >> 8 * i & 0xFFU);
}

/// Seven bits a byte, the least significant first, the high bit on all but the last.
inline void PutPacked(std::string& out, std::uint64_t number) {
    for (; number >= 0x80; number >>= 7)
        out.push_back(static_cast<char>((number & 0x7FU) | 0x80U));
    out.push_back(static_cast<char>(number));
}

/// Bytes given as hexadecimal digits, for the identifiers of the format.
inline std::string FromHex(std::string_view digits) {
    const auto value = [](char c) { return static_cast<unsigned>(c <= '9' ? c - '0' : c - 'a' + 10); };
    std::string out;
    for (std::size_t i = 0; i + 1 < digits.size(); i += 2)
        out.push_back(static_cast<char>(value(digits[i]) << 4 | value(digits[i + 1])));
    return out;
}

} // namespace tovimar::helpcompiler
