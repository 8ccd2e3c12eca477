#include "uimodel/DefinitionText.h"

#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/Error.h"
#include "platform/Value.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <charconv>

namespace tovimar::definition {

namespace {

/// Deeper than a document can be nested; the level itself is foreign input.
constexpr std::int32_t kDeepestLevel = 600;
constexpr std::size_t kKeywordCharacters = 32;

std::int32_t ToInteger(std::string_view number) {
    number.remove_prefix(std::min(number.find_first_not_of(' '), number.size()));
    std::int32_t whole = 0;
    const auto [end, error] = std::from_chars(number.data(), number.data() + number.size(), whole);
    if (error == std::errc() && end == number.data() + number.size())
        return whole;
    // Whatever else the host takes for a number, or its error.
    return Value(text::Trim(number)).AsInteger();
}

} // namespace

void Append(std::string& out, std::string_view opening, std::string_view value) {
    out.append(opening).append(value).append("\" ");
}

void Append(std::string& out, std::string_view opening, std::int32_t value) {
    Append(out, opening, std::to_string(value));
}

void AppendUnlessEmpty(std::string& out, std::string_view opening, std::string_view value) {
    if (!value.empty())
        Append(out, opening, value);
}

void AppendPlain(std::string& out, std::string_view opening, std::string_view value) {
    AppendUnlessEmpty(out, opening, Escaped(value));
}

std::string Escaped(std::string_view value) {
    std::string escaped;
    AppendEscaped(escaped, value);
    return escaped;
}

void AppendEscaped(std::string& out, std::string_view value) {
    std::size_t done = 0;
    for (std::size_t i = 0; i < value.size(); ++i) {
        const char c = value[i];
        const bool control = static_cast<unsigned char>(c) < ' ';
        if (c != '&' && c != '<' && c != '"' && !control)
            continue;
        out.append(value, done, i - done);
        done = i + 1;
        if (control)
            out.append("&#").append(std::to_string(c)).append(";");
        else
            out += c == '&' ? "&amp;" : c == '<' ? "&lt;" : "&quot;";
    }
    out.append(value, done);
}

void AppendPair(std::string& out, std::string_view opening, std::int32_t first, std::int32_t second) {
    Append(out, opening, std::to_string(first) + ", " + std::to_string(second));
}

std::string Indent(std::int32_t level) {
    return std::string(static_cast<std::size_t>(std::clamp(level, 0, kDeepestLevel)) * 2, ' ');
}

std::int32_t Integer(const XmlAttributes& node, std::string_view name, std::int32_t absent) {
    const std::string_view value = node.value(name);
    return value.empty() ? absent : ToInteger(value);
}

bool Boolean(const XmlAttributes& node, std::string_view name, bool absent) {
    const std::string_view value = node.value(name);
    return value.empty() ? absent : Value(text::Trim(value)).AsBoolean();
}

std::vector<std::int32_t> Numbers(const XmlAttributes& node, std::string_view name, std::size_t count) {
    std::string_view value = node.value(name);
    std::vector<std::int32_t> numbers;
    if (value.empty())
        return numbers;
    if (static_cast<std::size_t>(std::count(value.begin(), value.end(), ',')) + 1 < count)
        throw RaisedError(9, "Subscript out of range", std::string(name));
    numbers.reserve(count);
    while (numbers.size() < count) {
        const std::size_t comma = std::min(value.find(','), value.size());
        numbers.push_back(ToInteger(value.substr(0, comma)));
        value.remove_prefix(std::min(comma + 1, value.size()));
    }
    return numbers;
}

std::string TextOr(const XmlAttributes& node, std::string_view name, std::string_view fallback) {
    const std::string_view value = node.value(name);
    return std::string(value.empty() ? node.value(fallback) : value);
}

std::vector<XmlNode> ChildrenIn(const XmlNode& node, std::string_view name) {
    for (const XmlNode& child : node.childElements())
        if (child.nodeName() == name)
            return child.childElements();
    return {};
}

bool IdentifiedByName() {
    const CTovimarParameters* parameters = Session::Parameters();
    return parameters != nullptr && parameters->IdentifyControls != 0;
}

std::string ShortenedKeyword(const std::string& text) {
    return text::Length(text) > kKeywordCharacters ? text::Left(text, kKeywordCharacters) + "..." : text;
}

std::string KeywordWithoutMarks(const std::string& text) {
    return text::ReplaceAll(ShortenedKeyword(text), "&", "");
}

} // namespace tovimar::definition
