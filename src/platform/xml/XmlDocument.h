#pragma once

#include "platform/Error.h"

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace pugi {
class xml_document;
class xml_node;
struct xml_attribute_struct;
struct xml_parse_result;
struct xml_node_struct;
} // namespace pugi

/// The XML document object model that callers were written for, on pugixml. Stricter than the library:
/// exactly one root element with nothing but comments and white space behind it, no attribute twice,
/// no document type with entities; only the five predefined entities and numeric references expand.
/// At most 64 MiB of text and 512 levels; more is a parse error.
namespace tovimar {

/// What the parser said. Code 0 means no error; lines and positions count from 1, file position from 0.
struct XmlParseReport {
    ResultCode errorCode = 0;
    std::string reason;
    std::int32_t filepos = 0;
    std::int32_t line = 0;
    std::int32_t linepos = 0;
    std::string srcText; ///< the line of the error, at most 200 bytes
    std::string url;     ///< path of the file, native; empty for text
};

/// An attribute handle; an empty one has neither name nor value. The views are good until the attribute's
/// value is set or the document goes.
class XmlAttribute {
public:
    XmlAttribute() = default;
    explicit operator bool() const { return attribute_ != nullptr; }
    std::string_view name() const;
    std::string_view value() const;
    void setValue(std::string_view value);
    /// The attribute behind it in the source; empty behind the last.
    XmlAttribute next() const;

private:
    friend class XmlNode;
    explicit XmlAttribute(pugi::xml_attribute_struct* attribute) : attribute_(attribute) {}
    pugi::xml_attribute_struct* attribute_ = nullptr;
};

/// A node handle: cheap to copy, empty handles answer with nothing, valid while its document lives.
class XmlNode {
public:
    XmlNode() = default;
    explicit operator bool() const { return node_ != nullptr; }

    bool IsElement() const;
    bool IsComment() const;
    /// Tag name with its prefix; "#comment", "#text".
    std::string nodeName() const;
    /// The tag name of an element as a view, good while the document lives.
    std::string_view tagName() const;
    /// Tag name without its prefix.
    std::string baseName() const;
    XmlNode parent() const;
    XmlNode firstChild() const;
    XmlNode nextSibling() const;
    std::vector<XmlNode> childNodes() const;
    std::vector<XmlNode> childElements() const;

    /// Exact comparison, as the model has it. None when absent.
    std::optional<std::string> getAttribute(std::string_view name) const;
    std::string attribute(std::string_view name, std::string_view absent = {}) const;
    XmlAttribute firstAttribute() const;
    std::size_t attributeCount() const;
    /// 0-based, in the order of the source.
    std::string attributeName(std::size_t index) const;
    std::string attributeValue(std::size_t index) const;
    void setAttributeValue(std::size_t index, std::string_view value);
    void setAttribute(std::string_view name, std::string_view value);

    /// All text below the node.
    std::string text() const;
    /// The node as markup, no indentation added.
    std::string xml() const;

    /// XPath below this node; "//" starts at the document.
    XmlNode selectSingleNode(std::string_view xpath) const;
    std::vector<XmlNode> selectNodes(std::string_view xpath) const;

private:
    friend class XmlDocument;
    friend class XmlAttributes;
    explicit XmlNode(pugi::xml_node_struct* node) : node_(node) {}
    pugi::xml_node_struct* node_ = nullptr;
};

/// The attributes of one element, for readers of many of them: read once, found without a walk over pointers.
/// Views of the document's own text, good until the document changes or goes.
class XmlAttributes {
public:
    explicit XmlAttributes(const XmlNode& node);
    /// Exact comparison; `absent` where there is no such attribute.
    std::string_view value(std::string_view name, std::string_view absent = {}) const;
    std::string attribute(std::string_view name, std::string_view absent = {}) const {
        return std::string(value(name, absent));
    }

private:
    std::vector<std::pair<std::string_view, std::string_view>> attributes_;
};

class XmlDocument {
public:
    XmlDocument();
    ~XmlDocument();
    XmlDocument(XmlDocument&&) noexcept;
    XmlDocument& operator=(XmlDocument&&) noexcept;

    /// False on a parse error or a missing file; `parseError` says why. A Windows path.
    bool load(const std::string& path);
    /// Text with or without a declaration; it is UTF-8 whatever the declaration says.
    bool loadXML(std::string_view text);
    const XmlParseReport& parseError() const { return report_; }

    XmlNode documentElement() const;
    XmlNode selectSingleNode(std::string_view xpath) const;
    std::vector<XmlNode> selectNodes(std::string_view xpath) const;
    std::string xml() const;

private:
    bool Parse(std::string_view text);
    /// Parses what the buffer holds, where it stands.
    bool ParseBuffer();
    bool Check(std::string_view text);
    bool Take(const pugi::xml_parse_result& result, std::string_view text);
    std::unique_ptr<std::string> buffer_; ///< of a file: its nodes' texts stand in it
    std::unique_ptr<pugi::xml_document> document_;
    XmlParseReport report_;
};

} // namespace tovimar
