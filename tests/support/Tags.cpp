#include "support/Tags.h"

#include "foundation/TextEncodings.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::test {
namespace {

constexpr std::string_view kBlanks = " \t\r\n";

std::size_t SkipBlanks(const std::string& text, std::size_t at) {
    const auto next = text.find_first_not_of(kBlanks, at);
    return next == std::string::npos ? text.size() : next;
}

/// Goes behind the value, which may stand in quotes.
std::string ReadValue(const std::string& html, std::size_t& at) {
    const bool quoted = at < html.size() && (html[at] == '"' || html[at] == '\'');
    const std::size_t start = quoted ? at + 1 : at;
    std::size_t end = quoted ? html.find(html[at], start) : html.find_first_of(" \t\r\n>", start);
    end = std::min(end, html.size());
    at = std::min(end + (quoted ? 1 : 0), html.size());
    return html.substr(start, end - start);
}

Tag ReadTag(const std::string& html, std::size_t& at) {
    const std::size_t end = std::min(html.find_first_of(" \t\r\n/>", at), html.size());
    Tag tag{text::ToLower(html.substr(at, end - at)), {}};
    at = SkipBlanks(html, end);
    while (at < html.size() && html[at] != '>') {
        const std::size_t nameEnd = std::min(html.find_first_of("= \t\r\n>", at), html.size());
        const std::string name = text::ToLower(html.substr(at, nameEnd - at));
        at = SkipBlanks(html, nameEnd);
        std::string value;
        if (at < html.size() && html[at] == '=') {
            at = SkipBlanks(html, at + 1);
            value = ReadValue(html, at);
        }
        tag.attributes.emplace(name, value);
        at = SkipBlanks(html, at);
    }
    return tag;
}

} // namespace

std::string Tag::Attribute(const std::string& attribute) const {
    const auto found = attributes.find(attribute);
    return found == attributes.end() ? std::string() : DecodeHtmlEntities(found->second);
}

std::vector<Tag> TagsOf(const std::string& html) {
    std::vector<Tag> tags;
    for (std::size_t at = html.find('<'); at != std::string::npos; at = html.find('<', at)) {
        if (html.compare(at, 4, "<!--") == 0)
            at = std::min(html.find("-->", at), html.size());
        else
            tags.push_back(ReadTag(html, ++at));
    }
    return tags;
}

} // namespace tovimar::test
