#include "platform/text/Text.h"

#include "platform/Error.h"
#include "platform/text/CodePoints.h"

namespace tovimar::text {
namespace {

/// Byte position behind the given count of characters, from `position` on.
std::size_t Skip(std::string_view text, std::size_t position, std::size_t characters) {
    while (characters > 0 && position < text.size()) {
        NextCodePoint(text, position);
        --characters;
    }
    return position;
}

std::string TrimOf(std::string_view text, const char* characters) {
    const auto first = text.find_first_not_of(characters);
    if (first == std::string_view::npos)
        return {};
    return std::string(text.substr(first, text.find_last_not_of(characters) - first + 1));
}

} // namespace

std::string ReplaceAll(std::string_view text, std::string_view from, std::string_view to) {
    if (from.empty())
        return std::string(text);
    std::string out;
    std::size_t done = 0;
    for (auto at = text.find(from); at != std::string_view::npos; at = text.find(from, done)) {
        out.append(text, done, at - done);
        out += to;
        done = at + from.size();
    }
    out.append(text, done);
    return out;
}

std::size_t Length(std::string_view text) {
    std::size_t count = 0;
    for (std::size_t i = 0; i < text.size(); ++count)
        NextCodePoint(text, i);
    return count;
}

std::string Left(std::string_view text, std::size_t characters) {
    if (characters >= text.size())
        return std::string(text);
    return std::string(text.substr(0, Skip(text, 0, characters)));
}

std::string Right(std::string_view text, std::size_t characters) {
    if (characters >= text.size())
        return std::string(text);
    const std::size_t length = Length(text);
    return characters >= length ? std::string(text)
                                : std::string(text.substr(Skip(text, 0, length - characters)));
}

std::string Mid(std::string_view text, std::size_t start, std::size_t count) {
    if (start < 1)
        throw RaisedError(5, "Invalid procedure call or argument", "text::Mid");
    const std::size_t begin = Skip(text, 0, start - 1);
    const std::size_t end = count >= text.size() ? text.size() : Skip(text, begin, count);
    return std::string(text.substr(begin, end - begin));
}

std::string Trim(std::string_view text) {
    return TrimOf(text, " ");
}

std::string TrimWhitespace(std::string_view text) {
    return TrimOf(text, " \t\r\n");
}

std::vector<std::string> Split(std::string_view text, std::string_view separator) {
    std::vector<std::string> parts;
    std::size_t begin = 0;
    if (!separator.empty()) {
        for (auto at = text.find(separator); at != std::string_view::npos; at = text.find(separator, begin)) {
            parts.emplace_back(text.substr(begin, at - begin));
            begin = at + separator.size();
        }
    }
    parts.emplace_back(text.substr(begin));
    return parts;
}

std::string Join(const std::vector<std::string>& parts, std::string_view separator) {
    std::string out;
    for (std::size_t i = 0; i < parts.size(); ++i) {
        if (i > 0)
            out += separator;
        out += parts[i];
    }
    return out;
}

} // namespace tovimar::text
