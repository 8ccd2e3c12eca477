#include "foundation/TextEncodings.h"

#include "foundation/CSpecialChars.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace tovimar {
namespace {

constexpr bool IsIn(int value, int from, int to) {
    return value >= from && value <= to;
}

/// Characters below 128 that both encoders keep.
constexpr std::array<bool, 128> MakeKept() {
    std::array<bool, 128> kept{};
    for (int c = 0; c < 128; ++c)
        kept[static_cast<std::size_t>(c)] = c == 32 || c == 33 || IsIn(c, 35, 37) || IsIn(c, 40, 44) ||
                                            c == 46 || IsIn(c, 48, 58) || c == 61 || IsIn(c, 63, 91) ||
                                            c == 93 || c == 95 || IsIn(c, 97, 125);
    return kept;
}

constexpr auto kKept = MakeKept();

void AppendReference(std::string& out, char32_t number) {
    out += "&#";
    out += std::to_string(static_cast<std::uint32_t>(number));
    out += ';';
}

bool IsRussianLetter(char32_t codePoint) {
    return (codePoint >= 0x410 && codePoint <= 0x44F) || codePoint == 0x401 || codePoint == 0x451;
}

/// The characters from "&" through its ";" when both stand close enough to be an entity.
std::string_view CandidateAt(std::string_view text, std::size_t position) {
    const std::string_view near = text.substr(position, CSpecialChars::kLongest + 2);
    const auto end = near.find(';');
    return end == std::string_view::npos ? std::string_view() : near.substr(0, end + 1);
}

/// Zero, halves of surrogate pairs and the like name no character, and no reader of XML takes them.
bool IsCharacter(std::uint32_t number) {
    return number != 0 && number <= 0x10FFFF && (number < 0xD800 || number > 0xDFFF) && number != 0xFFFE &&
           number != 0xFFFF;
}

/// "&#39;" and the like, 1 to 7 digits.
bool IsNumericReference(std::string_view candidate) {
    if (!candidate.starts_with("&#") || !IsIn(static_cast<int>(candidate.size()), 4, 10))
        return false;
    const auto digits = candidate.substr(2, candidate.size() - 3);
    if (!std::all_of(digits.begin(), digits.end(), [](char digit) { return digit >= '0' && digit <= '9'; }))
        return false;
    std::uint32_t number = 0;
    std::from_chars(digits.data(), digits.data() + digits.size(), number);
    return IsCharacter(number);
}

/// What the two encoders do differently.
struct Rules {
    bool cyrillicAsEntity;
    bool keepSemicolon;
    /// ANSI values beside the Russian letters that count as Cyrillic.
    bool moreCyrillic;
    /// Named entities in their numeric form.
    bool namesToNumbers;
    /// What looks like an entity is text as well.
    bool everyMark = false;
};

/// Copies an entity at `position`, which moves behind it; false when none stands there.
bool CopyEntity(std::string_view text, std::size_t& position, std::string& out, const Rules& rules) {
    const std::string_view candidate = CandidateAt(text, position);
    if (candidate.empty())
        return false;
    const char32_t character = CSpecialChars::CharacterOf(candidate);
    // What an encoder wrote is an entity too, though no named one: texts pass through here twice.
    if (character == 0 && !IsNumericReference(candidate))
        return false;
    if (character != 0 && rules.namesToNumbers)
        AppendReference(out, character);
    else
        out += candidate;
    position += candidate.size();
    return true;
}

/// Viewers take the number of a reference for Unicode. A letter of the page whose value is another
/// character's number there stays a letter: "&#179;" for the Polish "l" with stroke would show a small three.
bool KeepsLetter(char32_t codePoint, int value, const Rules& rules) {
    if (IsIn(value, 128, 173) || IsIn(value, 225, 239))
        return true;
    const bool cyrillic =
        IsRussianLetter(codePoint) ||
        (rules.moreCyrillic && (value == 175 || value == 179 || value == 185 || value == 191));
    if (cyrillic)
        return !rules.cyrillicAsEntity;
    return value >= 128 && static_cast<char32_t>(value) != codePoint;
}

/// Behind the characters that stay as they are.
std::size_t SkipKept(std::string_view text, std::size_t position) {
    while (position < text.size() && text::IsAscii(text[position]) &&
           kKept[static_cast<unsigned char>(text[position])])
        ++position;
    return position;
}

void Append(std::string& out, std::string_view text, const Rules& rules) {
    const text::CodePage& page = text::AnsiCodePage();
    for (std::size_t i = 0; i < text.size();) {
        const std::size_t start = i;
        i = SkipKept(text, i);
        out.append(text, start, i - start);
        if (i == text.size())
            return;
        const std::size_t at = i;
        if (text[i] == '&' && !rules.everyMark && CopyEntity(text, i, out, rules))
            continue;
        const char32_t codePoint = text::NextCodePoint(text, i);
        if (codePoint < 128) {
            if (codePoint == ';' && rules.keepSemicolon)
                out += ';';
            else
                AppendReference(out, codePoint);
            continue;
        }
        const int value = page.AnsiValue(codePoint);
        if (KeepsLetter(codePoint, value, rules))
            out.append(text, at, i - at);
        else
            AppendReference(out, codePoint);
    }
}

std::string Encode(const std::string& text, const Rules& rules) {
    std::string out;
    out.reserve(text.size() + text.size() / 8);
    Append(out, text, rules);
    return out;
}

/// Character of a decimal reference "&#39;"; 0 for one that has none.
char32_t NumberedCharacter(std::string_view candidate) {
    if (!IsNumericReference(candidate))
        return 0;
    std::uint32_t number = 0;
    std::from_chars(candidate.data() + 2, candidate.data() + candidate.size() - 1, number);
    // Values of the ANSI page's upper controls were written by old tools that took them for characters.
    if (number >= 128 && number < 160) {
        const char byte = static_cast<char>(number);
        return text::ToCodePoints(text::AnsiCodePage().Decode(std::string_view(&byte, 1))).front();
    }
    return number;
}

/// One pass: every entity that `characterOf` knows becomes its character.
template <typename CharacterOf> std::string DecodePass(const std::string& text, CharacterOf characterOf) {
    std::string out;
    std::size_t done = 0;
    for (auto at = text.find('&'); at != std::string::npos; at = text.find('&', at)) {
        const std::string_view candidate = CandidateAt(text, at);
        const char32_t character = candidate.empty() ? 0 : characterOf(candidate);
        if (character == 0) {
            ++at;
            continue;
        }
        out.append(text, done, at - done);
        text::AppendCodePoint(out, character);
        at += candidate.size();
        done = at;
    }
    if (done == 0)
        return text;
    out.append(text, done);
    return out;
}

} // namespace

std::string EncodeSpecialChars(const std::string& text, bool vfCyrillicAsEntity) {
    return Encode(text, {vfCyrillicAsEntity, false, false, false});
}

std::string EncodeXmlText(const std::string& text, bool rfCyrillicAsEntity) {
    return Encode(text, {rfCyrillicAsEntity, true, true, true});
}

std::string EncodeXmlName(const std::string& name) {
    return Encode(name, {false, true, true, true, /*everyMark=*/true});
}

std::string EncodeSpecialName(const std::string& name) {
    std::string out;
    AppendSpecialName(out, name);
    return out;
}

void AppendSpecialChars(std::string& out, std::string_view text) {
    Append(out, text, {false, false, false, false});
}

void AppendSpecialName(std::string& out, std::string_view name) {
    Append(out, name, {false, false, false, false, /*everyMark=*/true});
}

std::string DecodeHtmlEntities(const std::string& text) {
    if (text.find('&') == std::string::npos)
        return text;
    // In this order: "&amp;lt;" was made by encoding twice and ends as "<".
    const std::string plain = text::ReplaceAllIgnoringCase(text, "&amp;", "&");
    const std::string named = DecodePass(plain, CSpecialChars::CharacterOf);
    return DecodePass(named, NumberedCharacter);
}

std::string DecodeEntities(const std::string& text) {
    return DecodeHtmlEntities(text);
}

} // namespace tovimar
