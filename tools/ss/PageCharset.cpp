#include "PageCharset.h"

#include "platform/text/Text.h"

#include <unicode/uchar.h>

#include <algorithm>
#include <cctype>
#include <cstdint>
#include <utility>

namespace tovimar::search {

namespace {

constexpr std::size_t kHeadBytes = 2048; ///< a page tells its charset in its head

char LowerAscii(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

std::string CharsetOf(std::string_view bytes) {
    const auto head = bytes.substr(0, kHeadBytes);
    auto start = FindAscii(head, "charset=", 0);
    if (start == std::string_view::npos)
        return {};
    start += 8;
    while (start < head.size() && (head[start] == '"' || head[start] == '\''))
        ++start;
    auto end = start;
    while (end < head.size() &&
           (std::isalnum(static_cast<unsigned char>(head[end])) != 0 || head[end] == '-'))
        ++end;
    return std::string(head.substr(start, end - start));
}

constexpr std::pair<std::string_view, std::string_view> kReferences[] = {
    {"amp", "&"},  {"lt", "<"},  {"gt", ">"},    {"quot", "\""}, {"nbsp", " "},
    {"copy", "©"}, {"reg", "®"}, {"mdash", "—"}, {"ndash", "–"}, {"apos", "'"},
};

std::string NumberedCharacter(std::string_view digits, int base) {
    std::uint32_t code = 0;
    for (const char c : digits) {
        const int digit = u_digit(static_cast<unsigned char>(c), static_cast<std::int8_t>(base));
        if (digit < 0 || code > 0x110000U)
            return {};
        code = code * static_cast<std::uint32_t>(base) + static_cast<std::uint32_t>(digit);
    }
    const bool surrogate = code >= 0xD800U && code <= 0xDFFFU;
    return code < 32 || code > 0x10FFFFU || surrogate ? " "
                                                      : text::FromCodePoint(static_cast<char32_t>(code));
}

} // namespace

std::size_t FindAscii(std::string_view page, std::string_view lower, std::size_t from) {
    const auto found = std::search(page.begin() + static_cast<std::ptrdiff_t>(std::min(from, page.size())),
                                   page.end(), lower.begin(), lower.end(),
                                   [](char left, char right) { return LowerAscii(left) == right; });
    return found == page.end() ? std::string_view::npos : static_cast<std::size_t>(found - page.begin());
}

std::string DecodePage(std::string_view bytes) {
    if (bytes.substr(0, 3) == "\xEF\xBB\xBF")
        return text::MakeValidUtf8(bytes.substr(3));
    const auto page = text::CodePageByCharsetName(CharsetOf(bytes));
    if (page == 65001)
        return text::MakeValidUtf8(bytes);
    return text::CodePage(page == 0 ? 1252 : page).Decode(bytes);
}

std::string CharacterOf(std::string_view reference) {
    if (reference.size() > 1 && reference[0] == '#') {
        const bool hex = reference[1] == 'x' || reference[1] == 'X';
        return reference.size() > (hex ? 2U : 1U)
                   ? NumberedCharacter(reference.substr(hex ? 2 : 1), hex ? 16 : 10)
                   : std::string();
    }
    for (const auto& [known, character] : kReferences)
        if (reference == known)
            return std::string(character);
    return {};
}

} // namespace tovimar::search
