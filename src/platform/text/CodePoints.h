#pragma once

#include <cstddef>
#include <string>
#include <string_view>

/// Stepping over UTF-8, for the text services themselves.
namespace tovimar::text {

constexpr char32_t kReplacement = 0xFFFD;

inline bool IsAscii(char byte) {
    return static_cast<unsigned char>(byte) < 0x80;
}
inline char LowerAscii(char byte) {
    return byte >= 'A' && byte <= 'Z' ? static_cast<char>(byte + 32) : byte;
}
bool IsAscii(std::string_view text);
/// Behind the ASCII bytes that begin at `position`.
std::size_t SkipAscii(std::string_view text, std::size_t position);

/// The character at `position`, which moves behind it. A byte that doesn't fit counts alone and gives
/// U+FFFD; `wellFormed`, when given, tells which of both it was.
char32_t NextCodePoint(std::string_view text, std::size_t& position, bool* wellFormed = nullptr);
void AppendCodePoint(std::string& out, char32_t codePoint);

} // namespace tovimar::text
