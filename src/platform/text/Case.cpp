#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <cstring>
#include <unicode/locid.h>
#include <unicode/uchar.h>
#include <unicode/unistr.h>

/// Comparing and searching without regard to case. ASCII runs over bytes; only texts with other letters pay
/// for the full folding.
namespace tovimar::text {
namespace {

std::string LowerAsciiCopy(std::string_view text) {
    std::string out(text);
    for (char& byte : out)
        byte = LowerAscii(byte);
    return out;
}

icu::UnicodeString ToIcu(std::string_view text) {
    const std::u16string utf16 = ToUtf16(text);
    return {utf16.data(), static_cast<std::int32_t>(utf16.size())};
}

std::string FromIcu(const icu::UnicodeString& text) {
    return FromUtf16({text.getBuffer(), static_cast<std::size_t>(text.length())});
}

/// Folding that keeps one character one character, for searching.
char32_t FoldOne(char32_t codePoint) {
    if (codePoint < 0x80)
        return static_cast<char32_t>(LowerAscii(static_cast<char>(codePoint)));
    return static_cast<char32_t>(u_foldCase(static_cast<UChar32>(codePoint), U_FOLD_CASE_DEFAULT));
}

std::size_t FindAscii(std::string_view text, std::string_view needle, std::size_t from) {
    const char lower = LowerAscii(needle[0]);
    const char upper = lower >= 'a' && lower <= 'z' ? static_cast<char>(lower - 32) : lower;
    const std::size_t last = text.size() - needle.size();
    for (std::size_t i = from; i <= last; ++i) {
        if (text[i] != lower && text[i] != upper)
            continue;
        std::size_t k = 1;
        while (k < needle.size() && LowerAscii(text[i + k]) == LowerAscii(needle[k]))
            ++k;
        if (k == needle.size())
            return i;
    }
    return std::string_view::npos;
}

/// Bytes of `text` at `position` that match the folded needle, 0 for no match.
std::size_t MatchAt(std::string_view text, std::size_t position, std::u32string_view folded) {
    std::size_t end = position;
    for (const char32_t wanted : folded) {
        if (end >= text.size() || FoldOne(NextCodePoint(text, end)) != wanted)
            return 0;
    }
    return end - position;
}

} // namespace

std::string FoldCase(std::string_view text) {
    if (IsAscii(text))
        return LowerAsciiCopy(text);
    return FromIcu(ToIcu(text).foldCase());
}

bool EqualsIgnoringCase(std::string_view left, std::string_view right) {
    return CompareIgnoringCase(left, right) == 0;
}

int CompareIgnoringCase(std::string_view left, std::string_view right) {
    const std::size_t common = std::min(left.size(), right.size());
    std::size_t i = 0;
    for (; i < common && IsAscii(left[i]) && IsAscii(right[i]); ++i) {
        const int difference = LowerAscii(left[i]) - LowerAscii(right[i]);
        if (difference == 0)
            continue;
        // A letter behind could still combine by folding only with its own follower, never with this one.
        return difference;
    }
    if (i == common && (left.size() == right.size() || (i == left.size() && i == right.size())))
        return 0;
    if (i == left.size())
        return -1;
    if (i == right.size())
        return 1;
    return FoldCase(left.substr(i)).compare(FoldCase(right.substr(i)));
}

bool StartsWithIgnoringCase(std::string_view text, std::string_view prefix) {
    if (IsAscii(prefix))
        return text.size() >= prefix.size() &&
               CompareIgnoringCase(text.substr(0, prefix.size()), prefix) == 0;
    std::u32string folded = ToCodePoints(prefix);
    for (char32_t& codePoint : folded)
        codePoint = FoldOne(codePoint);
    return MatchAt(text, 0, folded) != 0;
}

bool EndsWithIgnoringCase(std::string_view text, std::string_view suffix) {
    const std::size_t characters = Length(suffix);
    if (characters > Length(text))
        return false;
    return EqualsIgnoringCase(Right(text, characters), suffix);
}

std::string ToUpper(std::string_view text) {
    if (!IsAscii(text))
        return FromIcu(ToIcu(text).toUpper(icu::Locale::getRoot()));
    std::string out(text);
    for (char& byte : out)
        byte = byte >= 'a' && byte <= 'z' ? static_cast<char>(byte - 32) : byte;
    return out;
}

std::string ToLower(std::string_view text) {
    return IsAscii(text) ? LowerAsciiCopy(text) : FromIcu(ToIcu(text).toLower(icu::Locale::getRoot()));
}

std::size_t FindIgnoringCase(std::string_view text, std::string_view needle, std::size_t from,
                             std::size_t* matched) {
    if (matched != nullptr)
        *matched = needle.size();
    if (needle.empty())
        return from <= text.size() ? from : std::string_view::npos;
    if (from >= text.size())
        return std::string_view::npos;
    if (IsAscii(needle))
        return needle.size() > text.size() - from ? std::string_view::npos : FindAscii(text, needle, from);

    std::u32string folded = ToCodePoints(needle);
    for (char32_t& codePoint : folded)
        codePoint = FoldOne(codePoint);
    for (std::size_t i = from; i < text.size();) {
        const std::size_t length = MatchAt(text, i, folded);
        if (length != 0) {
            if (matched != nullptr)
                *matched = length;
            return i;
        }
        NextCodePoint(text, i);
    }
    return std::string_view::npos;
}

bool ContainsIgnoringCase(std::string_view text, std::string_view needle) {
    return FindIgnoringCase(text, needle) != std::string_view::npos;
}

std::string ReplaceAllIgnoringCase(std::string_view text, std::string_view from, std::string_view to) {
    if (from.empty())
        return std::string(text);
    std::string out;
    std::size_t done = 0;
    std::size_t matched = 0;
    for (auto at = FindIgnoringCase(text, from, 0, &matched); at != std::string_view::npos;
         at = FindIgnoringCase(text, from, done, &matched)) {
        out.append(text, done, at - done);
        out += to;
        done = at + matched;
    }
    out.append(text, done);
    return out;
}

} // namespace tovimar::text
