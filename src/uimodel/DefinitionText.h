#pragma once

#include "platform/xml/XmlDocument.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

/// The writing and reading of definitions' attributes. Their spacing is the format: a DOM reads past it, a
/// comparison of files doesn't.
namespace tovimar::definition {

inline constexpr std::string_view kLineEnd = "\r\n";

/// `opening` as it stands ("Name = \""), the value, a quote and one blank.
void Append(std::string& out, std::string_view opening, std::string_view value);
void Append(std::string& out, std::string_view opening, std::int32_t value);
/// The same for a non-empty value.
void AppendUnlessEmpty(std::string& out, std::string_view opening, std::string_view value);
/// The same for a value that the format doesn't encode: only what would break the element is escaped.
void AppendPlain(std::string& out, std::string_view opening, std::string_view value);
std::string Escaped(std::string_view value);
/// The same, behind a text: "&", "<", quotes and control characters become entities.
void AppendEscaped(std::string& out, std::string_view value);
/// Two numbers with a comma and a blank between them.
void AppendPair(std::string& out, std::string_view opening, std::int32_t first, std::int32_t second);
/// Two blanks a level; a level that no tree reaches counts as the deepest one.
std::string Indent(std::int32_t level);

/// Numbers of an attribute. An absent or empty one gives `absent`; other text raises error 13.
std::int32_t Integer(const XmlAttributes& node, std::string_view name, std::int32_t absent = 0);
bool Boolean(const XmlAttributes& node, std::string_view name, bool absent);
/// Parts of an attribute between commas, as numbers; none when it is absent or empty. Raises error 9 when
/// there are fewer than `count`.
std::vector<std::int32_t> Numbers(const XmlAttributes& node, std::string_view name, std::size_t count);
/// The element's text attribute, or the fallback's where it is empty.
std::string TextOr(const XmlAttributes& node, std::string_view name, std::string_view fallback);
/// The elements in the child of that name; none without it.
std::vector<XmlNode> ChildrenIn(const XmlNode& node, std::string_view name);

/// True when the run identifies objects and controls by name, not by caption.
bool IdentifiedByName();
/// Default index keyword: a text above 32 characters becomes its first 32 and "...".
std::string ShortenedKeyword(const std::string& text);
/// The same without accelerator marks, for controls and menu entries.
std::string KeywordWithoutMarks(const std::string& text);

} // namespace tovimar::definition
