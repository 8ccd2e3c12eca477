#include "platform/html/HtmlNode.h"

#include <string_view>
#include <unordered_set>

namespace tovimar {

namespace {

using Names = std::unordered_set<std::string_view>;

} // namespace

bool IsVoidElement(std::string_view name) {
    static const Names kNames{"area",  "base",   "basefont", "bgsound", "br",     "col",  "embed",
                              "frame", "hr",     "img",      "input",   "keygen", "link", "meta",
                              "param", "source", "track",    "wbr",     "isindex"};
    return kNames.contains(name);
}

bool IsRawTextElement(std::string_view name) {
    static const Names kNames{"script", "style", "xmp", "iframe", "noembed", "noframes", "plaintext"};
    return kNames.contains(name);
}

bool IsPreformattedElement(std::string_view name) {
    static const Names kNames{"pre", "textarea", "listing", "xmp", "plaintext"};
    return kNames.contains(name);
}

bool IsBlockElement(std::string_view name) {
    static const Names kNames{
        "address",  "article",    "aside",   "blockquote", "body",   "caption", "center",    "col",
        "colgroup", "dd",         "details", "dialog",     "dir",    "div",     "dl",        "dt",
        "fieldset", "figcaption", "figure",  "footer",     "form",   "frame",   "frameset",  "h1",
        "h2",       "h3",         "h4",      "h5",         "h6",     "head",    "header",    "hgroup",
        "hr",       "html",       "isindex", "legend",     "li",     "listing", "main",      "menu",
        "nav",      "noframes",   "ol",      "optgroup",   "option", "p",       "plaintext", "pre",
        "section",  "summary",    "table",   "tbody",      "td",     "tfoot",   "th",        "thead",
        "title",    "tr",         "ul",      "xmp"};
    return kNames.contains(name);
}

} // namespace tovimar
