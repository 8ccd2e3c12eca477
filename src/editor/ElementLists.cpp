#include "editor/ElementLists.h"

#include "platform/html/HtmlNode.h"
#include "platform/text/Text.h"

#include <string>
#include <unordered_set>

namespace tovimar {

namespace {

using Names = std::unordered_set<std::string_view>;

bool IsBlankText(const HtmlNode& node) {
    return node.IsText() && node.nodeValue().find_first_not_of(" \t\r\n\f") == std::string::npos;
}

} // namespace

bool IsFormattedBlock(std::string_view name) {
    static const Names kNames{"html",   "body",  "head", "ul",       "ol",     "dir",
                              "menu",   "dl",    "div",  "table",    "tbody",  "tr",
                              "select", "style", "form", "noframes", "script", "optgroup"};
    return kNames.contains(name);
}

bool IsInlineCloser(std::string_view name) {
    return name == "title" || name == "p" || name == "a";
}

bool ShowsWhiteSpace(const HtmlNode& node) {
    if (IsPreformattedElement(node.name()))
        return true;
    const HtmlAttribute* style = node.FindAttribute("style");
    const std::size_t at =
        style == nullptr ? std::string::npos : text::FindIgnoringCase(style->value, "white-space");
    return at != std::string::npos && text::FindIgnoringCase(style->value, "pre", at) != std::string::npos;
}

bool ShowsByItself(std::string_view name) {
    static const Names kNames{"img",    "input",  "button", "select",   "textarea", "iframe",
                              "object", "applet", "embed",  "video",    "audio",    "canvas",
                              "svg",    "math",   "meter",  "progress", "marquee"};
    return kNames.contains(name);
}

bool IsLeaf(const HtmlNode& node) {
    if (!node.IsForeign() && IsRawTextElement(node.name()))
        return true;
    const bool blanksCount = !IsFormattedBlock(node.name()) || ShowsWhiteSpace(node);
    for (const HtmlNode* child = node.firstChild(); child != nullptr; child = child->nextSibling())
        if (blanksCount || !IsBlankText(*child))
            return false;
    return true;
}

bool IsForcedAttribute(std::string_view name) {
    static const Names kNames{"shape",    "coords", "onload", "onunload", "onafterprint",
                              "onscroll", "type",   "value",  "selected"};
    return kNames.contains(name);
}

} // namespace tovimar
