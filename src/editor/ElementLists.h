#pragma once

#include <string_view>

namespace tovimar {

class HtmlNode;

/// How elements are laid out in the text of a page. Names are lower case.

/// Both of their tags stand on lines of their own.
bool IsFormattedBlock(std::string_view name);
/// Their end tag stands right behind what they hold.
bool IsInlineCloser(std::string_view name);
/// White space in them shows: by their kind, or because their own style says so.
bool ShowsWhiteSpace(const HtmlNode& node);
/// Something shows in the line where they stand, though they hold no text.
bool ShowsByItself(std::string_view name);
/// Elements without child nodes to write: empty, blocks with nothing but white space, scripts and the like.
bool IsLeaf(const HtmlNode& node);
/// Attributes that are written although they don't stand in the source.
bool IsForcedAttribute(std::string_view name);

} // namespace tovimar
