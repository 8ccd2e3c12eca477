#include "platform/xml/XmlDocument.h"

#include <pugixml.hpp>

namespace tovimar {
namespace {

pugi::xml_node Wrap(pugi::xml_node_struct* node) {
    return pugi::xml_node(node);
}

std::string_view View(const char* text) {
    return text;
}

pugi::xml_attribute FindAttribute(pugi::xml_node node, std::string_view name) {
    for (const auto attribute : node.attributes())
        if (View(attribute.name()) == name)
            return attribute;
    return {};
}

pugi::xml_attribute AttributeAt(pugi::xml_node node, std::size_t index) {
    auto attribute = node.first_attribute();
    while (attribute && index-- > 0)
        attribute = attribute.next_attribute();
    return attribute;
}

class StringWriter : public pugi::xml_writer {
public:
    void write(const void* data, std::size_t size) override {
        out.append(static_cast<const char*>(data), size);
    }
    std::string out;
};

void AppendText(pugi::xml_node node, std::string& out) {
    for (const auto child : node.children()) {
        if (child.type() == pugi::node_pcdata || child.type() == pugi::node_cdata)
            out += child.value();
        else if (child.type() == pugi::node_element)
            AppendText(child, out);
    }
}

/// Malformed paths are faults of the program, not of a file.
pugi::xpath_query Compile(std::string_view xpath) {
    try {
        return pugi::xpath_query(std::string(xpath).c_str());
    } catch (const pugi::xpath_exception& fault) {
        throw RaisedError(kFailure1, "XPath '" + std::string(xpath) + "': " + fault.what(), "XmlNode");
    }
}

} // namespace

std::string_view XmlAttribute::name() const {
    return pugi::xml_attribute(attribute_).name();
}

std::string_view XmlAttribute::value() const {
    return pugi::xml_attribute(attribute_).value();
}

void XmlAttribute::setValue(std::string_view value) {
    pugi::xml_attribute(attribute_).set_value(std::string(value).c_str());
}

XmlAttribute XmlAttribute::next() const {
    return XmlAttribute(pugi::xml_attribute(attribute_).next_attribute().internal_object());
}

std::string_view XmlNode::tagName() const {
    return Wrap(node_).name();
}

XmlAttribute XmlNode::firstAttribute() const {
    return XmlAttribute(Wrap(node_).first_attribute().internal_object());
}

XmlNode XmlNode::nextSibling() const {
    return XmlNode(Wrap(node_).next_sibling().internal_object());
}

XmlAttributes::XmlAttributes(const XmlNode& node) {
    attributes_.reserve(24);
    for (auto attribute = Wrap(node.node_).first_attribute(); attribute;
         attribute = attribute.next_attribute())
        attributes_.emplace_back(attribute.name(), attribute.value());
}

std::string_view XmlAttributes::value(std::string_view name, std::string_view absent) const {
    for (const auto& [own, value] : attributes_)
        if (own == name)
            return value;
    return absent;
}

bool XmlNode::IsElement() const {
    return Wrap(node_).type() == pugi::node_element;
}

bool XmlNode::IsComment() const {
    return Wrap(node_).type() == pugi::node_comment;
}

std::string XmlNode::nodeName() const {
    switch (Wrap(node_).type()) {
    case pugi::node_comment:
        return "#comment";
    case pugi::node_pcdata:
        return "#text";
    case pugi::node_cdata:
        return "#cdata-section";
    case pugi::node_document:
        return "#document";
    default:
        return Wrap(node_).name();
    }
}

std::string XmlNode::baseName() const {
    const std::string_view name = Wrap(node_).name();
    const auto colon = name.find(':');
    const std::string_view local = colon == std::string_view::npos ? name : name.substr(colon + 1);
    // What can't be a name by itself has no prefix in front.
    const bool isName =
        !local.empty() && std::string_view("0123456789-.:").find(local[0]) == std::string_view::npos;
    return std::string(isName ? local : name);
}

XmlNode XmlNode::parent() const {
    return XmlNode(Wrap(node_).parent().internal_object());
}

XmlNode XmlNode::firstChild() const {
    return XmlNode(Wrap(node_).first_child().internal_object());
}

std::vector<XmlNode> XmlNode::childNodes() const {
    std::vector<XmlNode> nodes;
    for (const auto child : Wrap(node_).children())
        nodes.push_back(XmlNode(child.internal_object()));
    return nodes;
}

std::vector<XmlNode> XmlNode::childElements() const {
    std::vector<XmlNode> nodes;
    for (const auto child : Wrap(node_).children())
        if (child.type() == pugi::node_element)
            nodes.push_back(XmlNode(child.internal_object()));
    return nodes;
}

std::optional<std::string> XmlNode::getAttribute(std::string_view name) const {
    const auto found = FindAttribute(Wrap(node_), name);
    return found ? std::optional<std::string>(found.value()) : std::nullopt;
}

std::string XmlNode::attribute(std::string_view name, std::string_view absent) const {
    const auto found = FindAttribute(Wrap(node_), name);
    return found ? std::string(found.value()) : std::string(absent);
}

std::size_t XmlNode::attributeCount() const {
    std::size_t count = 0;
    for (auto attribute = Wrap(node_).first_attribute(); attribute; attribute = attribute.next_attribute())
        ++count;
    return count;
}

std::string XmlNode::attributeName(std::size_t index) const {
    return AttributeAt(Wrap(node_), index).name();
}

std::string XmlNode::attributeValue(std::size_t index) const {
    return AttributeAt(Wrap(node_), index).value();
}

void XmlNode::setAttributeValue(std::size_t index, std::string_view value) {
    AttributeAt(Wrap(node_), index).set_value(std::string(value).c_str());
}

void XmlNode::setAttribute(std::string_view name, std::string_view value) {
    auto attribute = FindAttribute(Wrap(node_), name);
    if (!attribute)
        attribute = Wrap(node_).append_attribute(std::string(name).c_str());
    attribute.set_value(std::string(value).c_str());
}

std::string XmlNode::text() const {
    const auto node = Wrap(node_);
    if (node.type() != pugi::node_element && node.type() != pugi::node_document)
        return node.value();
    std::string out;
    AppendText(node, out);
    return out;
}

std::string XmlNode::xml() const {
    StringWriter writer;
    Wrap(node_).print(writer, "", pugi::format_raw | pugi::format_no_declaration, pugi::encoding_utf8);
    return std::move(writer.out);
}

XmlNode XmlNode::selectSingleNode(std::string_view xpath) const {
    const auto query = Compile(xpath);
    return XmlNode(Wrap(node_).select_node(query).node().internal_object());
}

std::vector<XmlNode> XmlNode::selectNodes(std::string_view xpath) const {
    const auto query = Compile(xpath);
    auto found = Wrap(node_).select_nodes(query);
    found.sort();
    std::vector<XmlNode> nodes;
    for (const auto& match : found)
        if (match.node())
            nodes.push_back(XmlNode(match.node().internal_object()));
    return nodes;
}

} // namespace tovimar
