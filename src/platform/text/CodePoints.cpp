#include "platform/text/CodePoints.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <cstring>
#include <unicode/utf16.h>
#include <unicode/utf8.h>

namespace tovimar::text {

bool IsAscii(std::string_view text) {
    return SkipAscii(text, 0) == text.size();
}

std::size_t SkipAscii(std::string_view text, std::size_t position) {
    constexpr std::uint64_t kHighBits = 0x8080808080808080ULL;
    for (std::uint64_t eight = 0; position + sizeof eight <= text.size(); position += sizeof eight) {
        std::memcpy(&eight, text.data() + position, sizeof eight);
        if ((eight & kHighBits) != 0)
            break;
    }
    while (position < text.size() && IsAscii(text[position]))
        ++position;
    return position;
}

char32_t NextCodePoint(std::string_view text, std::size_t& position, bool* wellFormed) {
    const auto* bytes = reinterpret_cast<const std::uint8_t*>(text.data());
    if (wellFormed != nullptr)
        *wellFormed = true;
    if (bytes[position] < 0x80)
        return bytes[position++];
    // A sequence is at most four bytes long, so the look-ahead needs no more of the text than that.
    const auto available = static_cast<std::int32_t>(std::min<std::size_t>(4, text.size() - position));
    std::int32_t used = 0;
    UChar32 codePoint = 0;
    U8_NEXT(bytes + position, used, available, codePoint);
    if (codePoint < 0) {
        if (wellFormed != nullptr)
            *wellFormed = false;
        ++position;
        return kReplacement;
    }
    position += static_cast<std::size_t>(used);
    return static_cast<char32_t>(codePoint);
}

void AppendCodePoint(std::string& out, char32_t codePoint) {
    if (codePoint < 0x80) {
        out += static_cast<char>(codePoint);
        return;
    }
    if (codePoint > 0x10FFFF || (codePoint >= 0xD800 && codePoint <= 0xDFFF))
        codePoint = kReplacement;
    std::uint8_t bytes[4];
    std::int32_t length = 0;
    U8_APPEND_UNSAFE(bytes, length, static_cast<UChar32>(codePoint));
    out.append(reinterpret_cast<const char*>(bytes), static_cast<std::size_t>(length));
}

std::u32string ToCodePoints(std::string_view text) {
    std::u32string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size();)
        out += NextCodePoint(text, i);
    return out;
}

std::string FromCodePoints(std::u32string_view codePoints) {
    std::string out;
    out.reserve(codePoints.size());
    for (const char32_t codePoint : codePoints)
        AppendCodePoint(out, codePoint);
    return out;
}

std::string FromCodePoint(char32_t codePoint) {
    return FromCodePoints(std::u32string_view(&codePoint, 1));
}

std::u16string ToUtf16(std::string_view text) {
    std::u16string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size();) {
        if (static_cast<unsigned char>(text[i]) < 0x80) {
            out += static_cast<char16_t>(text[i++]);
            continue;
        }
        const char32_t codePoint = NextCodePoint(text, i);
        if (codePoint < 0x10000) {
            out += static_cast<char16_t>(codePoint);
        } else {
            out += static_cast<char16_t>(U16_LEAD(codePoint));
            out += static_cast<char16_t>(U16_TRAIL(codePoint));
        }
    }
    return out;
}

std::string FromUtf16(std::u16string_view text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char32_t unit = text[i];
        if (unit < 0x80) {
            out += static_cast<char>(unit);
        } else if (U16_IS_LEAD(unit) && i + 1 < text.size() && U16_IS_TRAIL(text[i + 1])) {
            AppendCodePoint(out, static_cast<char32_t>(U16_GET_SUPPLEMENTARY(unit, text[i + 1])));
            ++i;
        } else {
            AppendCodePoint(out, unit);
        }
    }
    return out;
}

bool IsValidUtf8(std::string_view bytes) {
    bool wellFormed = true;
    for (std::size_t i = SkipAscii(bytes, 0); i < bytes.size() && wellFormed; i = SkipAscii(bytes, i))
        NextCodePoint(bytes, i, &wellFormed);
    return wellFormed;
}

std::string MakeValidUtf8(std::string_view bytes) {
    if (IsValidUtf8(bytes))
        return std::string(bytes);
    std::string out;
    out.reserve(bytes.size() + 16);
    for (std::size_t i = 0; i < bytes.size();)
        AppendCodePoint(out, NextCodePoint(bytes, i));
    return out;
}

} // namespace tovimar::text
