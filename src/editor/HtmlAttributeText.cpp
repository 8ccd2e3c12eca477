#include "editor/CHtmlNodeAttributes.h"
#include "editor/CHtmlStringFormatter.h"
#include "editor/ElementLists.h"
#include "platform/html/HtmlNode.h"
#include "platform/html/HtmlWriter.h"
#include "platform/text/Text.h"

#include <string>

/// The attributes of a page that is written.
namespace tovimar {

namespace {

bool IsEvent(const std::string& name) {
    return name == "onload" || name == "onunload" || name == "onafterprint" || name == "onscroll";
}

bool IsNothing(const std::string& value) {
    return value.empty() || value == "null" || value == "0";
}

/// A property of the element's own style; empty when it isn't set there.
std::string StyleProperty(const HtmlNode& node, const std::string& property) {
    for (const std::string& declaration :
         text::Split(node.getAttribute("style").value_or(std::string()), ";")) {
        const std::size_t colon = declaration.find(':');
        if (colon != std::string::npos &&
            text::EqualsIgnoringCase(text::TrimWhitespace(declaration.substr(0, colon)), property))
            return text::TrimWhitespace(declaration.substr(colon + 1));
    }
    return {};
}

void AddPair(CHtmlStringBuilder& sb, const std::string& indent, const std::string& name,
             const std::string& encodedValue) {
    if (sb.LastTokenIsCrLf())
        sb.AddString(indent);
    sb.AddString(" " + name + "=\"" + encodedValue + "\"");
}

} // namespace

void CHtmlStringFormatter::WriteAttributes(CHtmlStringBuilder& sb, const std::string& indent,
                                           const HtmlNode& node) {
    if (!UseSourceAttributes) {
        for (const HtmlAttribute& attribute : node.attributes())
            WriteAttribute(sb, indent, node, attribute);
        return;
    }
    CHtmlNodeAttributes source;
    source.Page = Page;
    for (const CHtmlAttribute& attribute : source.GetNodeAttributes(node))
        AddPair(sb, indent, attribute.Name, text::ReplaceAll(attribute.Value, "\"", "&quot;"));
}

void CHtmlStringFormatter::WriteAttribute(CHtmlStringBuilder& sb, const std::string& indent,
                                          const HtmlNode& node, const HtmlAttribute& attribute) {
    // A name with "<" in front is what is left of a tag that wasn't closed.
    if ((!attribute.specified && !IsForcedAttribute(attribute.name)) || attribute.name.starts_with('<'))
        return;
    const std::string value = ValueOf(node, attribute);
    if (!attribute.specified && IsNothing(value))
        return;
    std::string encoded;
    AppendEncoded(encoded, value, /*quotes=*/true);
    AddPair(sb, indent, attribute.name, encoded);
}

std::string CHtmlStringFormatter::ValueOf(const HtmlNode& node, const HtmlAttribute& attribute) const {
    const std::string& name = attribute.name;
    const bool ownTagOnly =
        name == "value" || name == "selected" || IsEvent(name) || (name == "type" && node.Is("button"));
    if (ownTagOnly)
        return attribute.specified ? attribute.value : std::string();
    if (name == "nohref" && text::EqualsIgnoringCase(attribute.value, "true"))
        return "-1";
    if ((name == "href" || name == "src") && !node.Is("base"))
        return Page.Relative(attribute.value);
    if ((name == "width" || name == "height") && node.Is("img") && attribute.value == "0") {
        const std::string styled = StyleProperty(node, name);
        return styled.empty() ? attribute.value : styled;
    }
    return attribute.value;
}

} // namespace tovimar
