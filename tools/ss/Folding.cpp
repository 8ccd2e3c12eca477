#include "Folding.h"

#include "platform/text/Text.h"

#include <unicode/locid.h>
#include <unicode/normalizer2.h>
#include <unicode/uchar.h>
#include <unicode/unistr.h>

#include <algorithm>
#include <cstdint>
#include <utility>

namespace tovimar::search {

namespace {

/// Letters that have no accent to take off.
constexpr std::pair<char32_t, std::u32string_view> kPlainLetters[] = {
    {U'ß', U"ss"}, {U'æ', U"ae"}, {U'œ', U"oe"}, {U'ø', U"o"},  {U'ł', U"l"}, {U'đ', U"d"},
    {U'ð', U"d"},  {U'ħ', U"h"},  {U'ı', U"i"},  {U'þ', U"th"}, {U'ς', U"σ"},
};

bool IsAscii(std::string_view text) {
    return std::all_of(text.begin(), text.end(), [](char c) { return static_cast<unsigned char>(c) < 128; });
}

std::u32string TakenApart(std::string_view text) {
    UErrorCode status = U_ZERO_ERROR;
    const auto* decomposer = icu::Normalizer2::getNFKDInstance(status);
    auto whole =
        icu::UnicodeString::fromUTF8(icu::StringPiece(text.data(), static_cast<std::int32_t>(text.size())));
    auto apart = decomposer->normalize(whole, status).toLower(icu::Locale::getRoot());
    std::string utf8;
    apart.toUTF8String(utf8);
    return text::ToCodePoints(utf8);
}

bool IsIdeograph(char32_t c) {
    return (c >= 0x3040 && c <= 0x30FF) || (c >= 0x3400 && c <= 0x9FFF) || (c >= 0xF900 && c <= 0xFAFF);
}

bool IsWordCharacter(char32_t c) {
    const auto kinds = static_cast<std::uint32_t>(U_GET_GC_MASK(static_cast<UChar32>(c)));
    return (kinds & (U_GC_L_MASK | U_GC_N_MASK | U_GC_M_MASK)) != 0;
}

} // namespace

std::string Fold(std::string_view text) {
    if (IsAscii(text))
        return text::ToLower(text);
    std::u32string folded;
    for (const auto c : TakenApart(text)) {
        const auto* plain = std::find_if(std::begin(kPlainLetters), std::end(kPlainLetters),
                                         [c](const auto& letter) { return letter.first == c; });
        if (plain != std::end(kPlainLetters))
            folded += plain->second;
        else if (c < 0x300 || c > 0x36F)
            folded += c;
    }
    return text::FromCodePoints(folded);
}

std::vector<std::string> WordsOf(std::string_view text) {
    std::vector<std::string> words;
    std::u32string word;
    const auto finish = [&] {
        if (!word.empty())
            words.push_back(text::FromCodePoints(word));
        word.clear();
    };
    for (const auto c : text::ToCodePoints(Fold(text))) {
        if (IsIdeograph(c) || !IsWordCharacter(c))
            finish();
        if (IsWordCharacter(c) && word.size() < kLongestWord)
            word += c;
        if (IsIdeograph(c))
            finish();
    }
    finish();
    return words;
}

} // namespace tovimar::search
