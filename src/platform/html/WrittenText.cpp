#include "platform/html/WrittenText.h"

#include "platform/text/CodePoints.h"

namespace tovimar {

namespace {

constexpr std::size_t kLongestEntity = 34;

/// Steps over an entity in the source and the character that it stands for; false when there is none.
bool StepOverEntity(std::string_view text, std::size_t& inText, std::string_view source,
                    std::size_t& inSource) {
    const std::size_t end = source.substr(inSource, kLongestEntity).find(';');
    if (end == std::string_view::npos || inText >= text.size())
        return false;
    const std::string_view entity = source.substr(inSource, end + 1);
    const bool means = entity == "&amp;" || entity == "&#38;" || entity == "&AMP;" || entity == "&#x26;";
    if ((text[inText] == '&') != means)
        return false;
    text::NextCodePoint(text, inText);
    inSource += entity.size();
    return true;
}

bool IsSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\f';
}

} // namespace

bool IsWrittenAs(std::string_view text, std::string_view source) {
    if (source == text)
        return source.find('<') == std::string_view::npos;
    std::size_t inText = 0;
    std::size_t inSource = 0;
    while (inSource < source.size()) {
        const char c = source[inSource];
        if (c == '&' && StepOverEntity(text, inText, source, inSource))
            continue;
        if (c == '\r' && source.substr(inSource + 1).starts_with("\n")) {
            ++inSource;
            continue;
        }
        const char read = c == '\r' ? '\n' : c;
        if (c == '<' || inText >= text.size() || text[inText] != read)
            return false;
        ++inText;
        ++inSource;
    }
    return inText == text.size();
}

bool IsTextWithLineEnds(std::string_view text, std::string_view source) {
    std::size_t inText = 0;
    for (std::size_t i = 0; i < source.size(); ++i) {
        if (source[i] == '\r' && source.substr(i + 1).starts_with("\n"))
            continue;
        if (inText == text.size() || text[inText++] != (source[i] == '\r' ? '\n' : source[i]))
            return false;
    }
    return inText == text.size();
}

std::size_t SpacesOutsideTags(std::string_view tail) {
    std::size_t spaces = 0;
    for (std::size_t i = 0; i < tail.size(); ++i) {
        if (tail[i] == '<') {
            const bool comment = tail.substr(i).starts_with("<!--");
            i = comment ? tail.find("-->", i + 4) : tail.find('>', i);
            if (i == std::string_view::npos)
                return 0;
            i += comment ? 2 : 0;
        } else if (IsSpace(tail[i])) {
            ++spaces;
        } else if (tail[i] == '\r') {
            spaces += tail.substr(i + 1).starts_with("\n") ? 0 : 1;
        } else {
            return 0;
        }
    }
    return spaces;
}

} // namespace tovimar
