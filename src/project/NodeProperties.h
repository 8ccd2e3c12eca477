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

/// The values of all properties of one node at one moment, for writers of many of them: the attributes are
/// walked once. Views of the node's own texts, good until it changes.
struct NodePropertyViews {
    std::array<std::string_view, static_cast<std::size_t>(NodeProperty::Count)> values;
    /// Of the attribute "Indexes"; with `hasMoreIndexes` there are numbered ones beside it.
    std::string_view indexes;
    bool hasMoreIndexes = false;

    std::string_view operator[](NodeProperty property) const {
        return values[static_cast<std::size_t>(property)];
    }
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

    /// Empty, or the property's default ("-1" for the object type, "0" for numbers and flags). Good until the
    /// next write.
    std::string_view Read(NodeProperty property) const;
    NodePropertyViews ReadAll() const;
    /// Into the element's attribute when it has one, else into the side table.
    void Write(NodeProperty property, const std::string& value);
    /// Any attribute of the element by name; empty when absent or without an element.
    std::string_view ReadAttribute(std::string_view name) const;

private:
    std::shared_ptr<XmlDocument> document_;
    XmlNode element_;
    std::vector<std::pair<NodeProperty, std::string>> side_;
};

} // namespace tovimar
