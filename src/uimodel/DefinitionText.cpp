#include "uimodel/DefinitionText.h"

#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/Error.h"
#include "platform/Value.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::definition {

namespace {

/// Deeper than a document can be nested; the level itself is foreign input.
constexpr std::int32_t kDeepestLevel = 600;
constexpr std::size_t kKeywordCharacters = 32;

std::int32_t ToInteger(const std::string& number) {
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
    for (const char c : value) {
        if (c == '&')
            escaped += "&amp;";
        else if (c == '<')
            escaped += "&lt;";
        else if (c == '"')
            escaped += "&quot;";
        else if (static_cast<unsigned char>(c) < ' ')
            escaped.append("&#").append(std::to_string(c)).append(";");
        else
            escaped += c;
    }
    return escaped;
}

void AppendPair(std::string& out, std::string_view opening, std::int32_t first, std::int32_t second) {
    Append(out, opening, std::to_string(first) + ", " + std::to_string(second));
}

std::string Indent(std::int32_t level) {
    return std::string(static_cast<std::size_t>(std::clamp(level, 0, kDeepestLevel)) * 2, ' ');
}

std::int32_t Integer(const XmlNode& node, std::string_view name, std::int32_t absent) {
    const std::string value = node.attribute(name);
    return value.empty() ? absent : ToInteger(value);
}

bool Boolean(const XmlNode& node, std::string_view name, bool absent) {
    const std::string value = node.attribute(name);
    return value.empty() ? absent : Value(text::Trim(value)).AsBoolean();
}

std::vector<std::int32_t> Numbers(const XmlNode& node, std::string_view name, std::size_t count) {
    const std::string value = node.attribute(name);
    std::vector<std::int32_t> numbers;
    if (value.empty())
        return numbers;
    const auto parts = text::Split(value, ",");
    if (parts.size() < count)
        throw RaisedError(9, "Subscript out of range", std::string(name));
    for (std::size_t i = 0; i < count; ++i)
        numbers.push_back(ToInteger(parts[i]));
    return numbers;
}

std::string TextOr(const XmlNode& node, std::string_view name, std::string_view fallback) {
    std::string value = node.attribute(name);
    return value.empty() ? node.attribute(fallback) : value;
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
