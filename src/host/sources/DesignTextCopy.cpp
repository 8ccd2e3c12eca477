#include "host/sources/DesignTextCopy.h"

#include "host/sources/TextLines.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

/// A quoted text goes on in quotes on the lines below.
bool ContinuesQuotedText(std::string_view line) {
    return line.size() >= 2 && line.front() == '"';
}

/// The sign behind a backslash: three octal digits stand for a character, anything else for itself.
std::string Unescaped(std::string_view quoted) {
    std::string text;
    for (std::size_t i = 0; i < quoted.size(); ++i) {
        if (quoted[i] != '\\' || i + 1 == quoted.size()) {
            text += quoted[i];
            continue;
        }
        const std::string_view digits = quoted.substr(i + 1, 3);
        if (digits.size() == 3 && digits.find_first_not_of("01234567") == std::string_view::npos) {
            const int code = (digits[0] - '0') * 64 + (digits[1] - '0') * 8 + (digits[2] - '0');
            text += text::FromCodePoint(static_cast<char32_t>(code));
            i += 3;
        } else {
            text += quoted[++i];
        }
    }
    return text;
}

/// From behind the first double quote up to the last character, which closes it; a long text goes on in
/// quotes on the lines below.
std::string QuotedValue(std::string_view line, TextLines& lines) {
    std::string value;
    do {
        const auto open = line.find('"');
        if (open == std::string_view::npos || open + 1 >= line.size())
            break;
        value += Unescaped(line.substr(open + 1, line.size() - open - 2));
    } while (lines.NextIf(line, ContinuesQuotedText));
    return text::TrimWhitespace(value);
}

/// The property's name is the whole word, so that "CaptionFont" isn't taken for "Caption".
bool IsProperty(std::string_view line, std::string_view name) {
    if (!text::StartsWithIgnoringCase(line, name))
        return false;
    const auto next = line.find_first_not_of(" \t", name.size());
    return next != std::string_view::npos && line[next] == '=';
}

bool SkipToObject(TextLines& lines, const std::string& start) {
    std::string_view line;
    while (lines.Next(line))
        if (text::StartsWithIgnoringCase(line, start))
            return true;
    return false;
}

} // namespace

DesignTextCopy ParseDesignTextCopy(std::string_view text, std::string_view typeWord) {
    DesignTextCopy copy;
    TextLines lines(text);
    if (!SkipToObject(lines, "Begin " + std::string(typeWord)))
        return copy;
    const std::string prefix = std::string(typeWord) + ".";
    bool nested = false;
    std::string_view line;
    while (lines.Next(line) && !text::StartsWithIgnoringCase(line, "CodeBehind")) {
        if (line.substr(0, 5) == "Begin") {
            nested = true;
        } else if (!nested && IsProperty(line, "Caption")) {
            copy.caption = QuotedValue(line, lines);
        } else if (nested && !typeWord.empty() && IsProperty(line, "SourceObject")) {
            const std::string source = QuotedValue(line, lines);
            if (text::StartsWithIgnoringCase(source, prefix) && source.size() > prefix.size())
                copy.subforms.push_back(source.substr(prefix.size()));
        }
    }
    return copy;
}

} // namespace tovimar
