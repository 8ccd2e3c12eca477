#include "TopicText.h"

#include "platform/text/Text.h"

#include <unicode/uchar.h>

#include <algorithm>
#include <cctype>
#include <cstdint>
#include <utility>

namespace tovimar::search {

namespace {

constexpr std::size_t kHeadBytes = 2048; ///< a page tells its charset in its head
constexpr std::size_t kLongestReference = 10;

char LowerAscii(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

/// ASCII only, on bytes: tags and attributes are.
std::size_t FindTag(std::string_view page, std::string_view tag, std::size_t from) {
    const auto found =
        std::search(page.begin() + static_cast<std::ptrdiff_t>(std::min(from, page.size())), page.end(),
                    tag.begin(), tag.end(), [](char left, char right) { return LowerAscii(left) == right; });
    return found == page.end() ? std::string_view::npos : static_cast<std::size_t>(found - page.begin());
}

std::string CharsetOf(std::string_view bytes) {
    const auto head = bytes.substr(0, kHeadBytes);
    auto start = FindTag(head, "charset=", 0);
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

std::string Decode(std::string_view bytes) {
    if (bytes.substr(0, 3) == "\xEF\xBB\xBF")
        return text::MakeValidUtf8(bytes.substr(3));
    const auto page = text::CodePageByCharsetName(CharsetOf(bytes));
    if (page == 65001)
        return text::MakeValidUtf8(bytes);
    return text::CodePage(page == 0 ? 1252 : page).Decode(bytes);
}

const std::pair<const char*, const char*> kReferences[] = {
    {"amp", "&"},  {"lt", "<"},  {"gt", ">"},    {"quot", "\""}, {"nbsp", " "},
    {"copy", "©"}, {"reg", "®"}, {"mdash", "—"}, {"ndash", "–"}, {"apos", "'"},
};

/// The character of a reference such as "amp" or "#1041"; empty for one that isn't known.
std::string CharacterOf(std::string_view name) {
    if (name.size() > 1 && name[0] == '#') {
        const bool hex = name[1] == 'x' || name[1] == 'X';
        std::uint32_t code = 0;
        for (const char c : name.substr(hex ? 2 : 1)) {
            const int digit = u_digit(static_cast<unsigned char>(c), hex ? 16 : 10);
            if (digit < 0 || code > 0x110000U)
                return {};
            code = code * (hex ? 16U : 10U) + static_cast<std::uint32_t>(digit);
        }
        return code < 32 || code > 0x10FFFFU ? " " : text::FromCodePoint(static_cast<char32_t>(code));
    }
    for (const auto& [known, character] : kReferences)
        if (name == known)
            return character;
    return {};
}

/// Appends what stands for the "&" at `at`, gives the position behind it.
std::size_t AppendReference(std::string_view page, std::size_t at, std::string& out) {
    const auto end = page.substr(at, kLongestReference).find(';');
    const auto character =
        end == std::string_view::npos ? std::string() : CharacterOf(page.substr(at + 1, end - 1));
    out += character.empty() ? "&" : character;
    return character.empty() ? at + 1 : at + end + 1;
}

std::size_t Behind(std::string_view page, std::string_view tag, std::size_t from) {
    const auto found = FindTag(page, tag, from);
    return found == std::string_view::npos ? page.size() : found + tag.size();
}

/// Position behind the tag at `at`, or behind the whole element of a script, a style or a title.
std::size_t SkipTag(std::string_view page, std::size_t at) {
    const auto here = [&](std::string_view tag) { return FindTag(page.substr(at, tag.size()), tag, 0) == 0; };
    if (here("<!--"))
        return Behind(page, "-->", at);
    if (here("<script"))
        return Behind(page, "</script>", at);
    if (here("<style"))
        return Behind(page, "</style>", at);
    if (here("<title"))
        return Behind(page, "</title>", at);
    return Behind(page, ">", at);
}

std::string VisibleText(std::string_view page) {
    std::string out;
    const auto blank = [&] {
        if (!out.empty() && out.back() != ' ')
            out += ' ';
    };
    for (std::size_t at = 0; at < page.size();) {
        const char c = page[at];
        if (c == '<') {
            at = SkipTag(page, at);
            blank();
        } else if (c == '&') {
            at = AppendReference(page, at, out);
        } else if (static_cast<unsigned char>(c) <= ' ') {
            ++at;
            blank();
        } else {
            out += c;
            ++at;
        }
    }
    return text::Trim(out);
}

/// Visible text between the first open tag of this name and its end.
std::string ElementText(std::string_view page, std::string_view open, std::string_view close) {
    const auto start = FindTag(page, open, 0);
    if (start == std::string_view::npos)
        return {};
    const auto from = Behind(page, ">", start);
    const auto end = FindTag(page, close, from);
    return end == std::string_view::npos ? std::string() : VisibleText(page.substr(from, end - from));
}

bool IsIdeograph(char32_t c) {
    return (c >= 0x3040 && c <= 0x30FF) || (c >= 0x3400 && c <= 0x9FFF) || (c >= 0xF900 && c <= 0xFAFF);
}

bool IsWordCharacter(char32_t c) {
    const auto kinds = static_cast<std::uint32_t>(U_GET_GC_MASK(static_cast<UChar32>(c)));
    return (kinds & (U_GC_L_MASK | U_GC_N_MASK | U_GC_M_MASK)) != 0;
}

} // namespace

TopicText ReadTopic(std::string_view bytes) {
    const auto page = Decode(bytes);
    TopicText topic;
    topic.title = ElementText(page, "<title", "</title>");
    if (topic.title.empty())
        topic.title = ElementText(page, "<h1", "</h1>");
    topic.body = VisibleText(page);
    return topic;
}

std::vector<std::string> WordsOf(std::string_view text) {
    std::vector<std::string> words;
    std::u32string word;
    const auto finish = [&] {
        if (!word.empty())
            words.push_back(text::FromCodePoints(word));
        word.clear();
    };
    for (const auto c : text::ToCodePoints(text::ToLower(text))) {
        if (IsIdeograph(c) || !IsWordCharacter(c))
            finish();
        if (IsWordCharacter(c))
            word += c;
        if (IsIdeograph(c))
            finish();
    }
    finish();
    return words;
}

} // namespace tovimar::search
