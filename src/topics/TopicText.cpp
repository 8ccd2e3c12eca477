#include "topics/TopicText.h"

#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar {

namespace {

char Lower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c + ('a' - 'A')) : c;
}

char Upper(char c) {
    return c >= 'a' && c <= 'z' ? static_cast<char>(c - ('a' - 'A')) : c;
}

bool MatchesAt(std::string_view text, std::string_view needle, std::size_t position) {
    return position + needle.size() <= text.size() &&
           EqualsAscii(text.substr(position, needle.size()), needle);
}

} // namespace

bool EqualsAscii(std::string_view left, std::string_view right) {
    if (left.size() != right.size())
        return false;
    for (std::size_t i = 0; i < left.size(); ++i)
        if (Lower(left[i]) != Lower(right[i]))
            return false;
    return true;
}

bool StartsWithAscii(std::string_view text, std::string_view prefix) {
    return MatchesAt(text, prefix, 0);
}

std::size_t FindAscii(std::string_view text, std::string_view needle, std::size_t from) {
    if (needle.empty() || text.size() < needle.size())
        return needle.empty() && from <= text.size() ? from : std::string_view::npos;
    // Needles begin with "{", "<" or the like, which has no case: the library's search for one byte is what
    // makes a pass over a page cheap.
    const char first = needle.front();
    const bool hasCase = Lower(first) != Upper(first);
    std::size_t lower = text.find(Lower(first), from);
    std::size_t upper = hasCase ? text.find(Upper(first), from) : std::string_view::npos;
    while (true) {
        from = std::min(lower, upper);
        if (from == std::string_view::npos || MatchesAt(text, needle, from))
            return from;
        if (from == lower)
            lower = text.find(Lower(first), from + 1);
        else
            upper = text.find(Upper(first), from + 1);
    }
}

void ReplaceTag(std::string& page, std::string_view tag, std::string_view value) {
    std::size_t found = FindAscii(page, tag);
    if (found == std::string::npos)
        return;
    std::string replaced;
    replaced.reserve(page.size() + value.size());
    std::size_t begin = 0;
    for (; found != std::string::npos; found = FindAscii(page, tag, begin)) {
        replaced.append(page, begin, found - begin).append(value);
        begin = found + tag.size();
    }
    replaced.append(page, begin);
    page = std::move(replaced);
}

void ReplaceTagWith(std::string& page, std::string_view tag, const std::function<std::string()>& value) {
    if (FindAscii(page, tag) != std::string::npos)
        ReplaceTag(page, tag, value());
}

void CutRegion(std::string& page, std::string_view opening, std::string_view closing) {
    const std::size_t begin = FindAscii(page, opening);
    const std::size_t end = FindAscii(page, closing);
    if (begin != std::string::npos && end != std::string::npos && end > begin)
        page.erase(begin, end + closing.size() - begin);
}

std::string_view Between(std::string_view page, std::string_view opening, std::string_view closing) {
    std::size_t begin = FindAscii(page, opening);
    if (begin == std::string_view::npos)
        return {};
    begin += opening.size();
    const std::size_t end = FindAscii(page, closing, begin);
    return end == std::string_view::npos ? std::string_view() : page.substr(begin, end - begin);
}

std::string WithoutLineEnds(std::string_view text) {
    return text::ReplaceAll(text, "\r\n", "");
}

} // namespace tovimar
