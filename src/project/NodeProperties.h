#pragma once

#include "platform/xml/XmlDocument.h"

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace tovimar {

/// The attributes that a node of a project file gives a meaning.
enum class NodeProperty : std::uint8_t {
    Name,
    Caption,
    Title,
    Key,
    ParentKey,
    PreviousNodeKey,
    NextNodeKey,
    OriginalKey,
    ParentOriginalKey,
    Type,
    ObjectType,
    ProcessCode,
    Skipped,
    Hidden,
    Icon,
    Bookmark,
    Serializer,
    Charset,
    ExtraValue,
    CSSFullPath,
    PicsSubfolderName,
    SourceProjectType,
    SourceProjectName,
    TemplateHtmlFile,
    Html,
    Htm,
    GeneratedHtmlFile,
    GenHtml,
    Count
};

/// The property values of one node. A node of a document keeps them in the attributes of its element, the
/// document being shared by all its nodes; a node made in memory, and every property that the element has
/// no attribute for, uses a side table. Attribute names compare without regard to case, the first of two
/// that differ only in case counts.
class NodeProperties {
public:
    /// Moves in; the values of the side table stay for properties that the element lacks.
    void Attach(std::shared_ptr<XmlDocument> document, XmlNode element);
    /// Lets element, document and values go.
    void Release();
    bool HasElement() const { return static_cast<bool>(element_); }

    /// Empty, or the property's default ("-1" for the object type, "0" for numbers and flags).
    std::string Read(NodeProperty property) const;
    /// Into the element's attribute when it has one, else into the side table.
    void Write(NodeProperty property, const std::string& value);
    /// Any attribute of the element by name; empty when absent or without an element.
    std::string ReadAttribute(std::string_view name) const;

private:
    static constexpr std::size_t kCount = static_cast<std::size_t>(NodeProperty::Count);

    void FindAttributes() const;

    std::shared_ptr<XmlDocument> document_;
    XmlNode element_;
    /// Position of each property's attribute, -1 for none; found once, since attributes are never added.
    mutable std::array<std::int16_t, kCount> positions_{};
    mutable bool positionsKnown_ = false;
    std::vector<std::pair<NodeProperty, std::string>> side_;
};

} // namespace tovimar
