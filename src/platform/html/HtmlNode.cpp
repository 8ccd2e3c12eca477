#include "platform/html/HtmlNode.h"

#include "platform/Error.h"
#include "platform/html/HtmlDocument.h"
#include "platform/text/CodePoints.h"

#include <algorithm>

namespace tovimar {

namespace {

bool SameName(std::string_view left, std::string_view right) {
    return std::ranges::equal(left, right,
                              [](char a, char b) { return text::LowerAscii(a) == text::LowerAscii(b); });
}

std::string Upper(std::string name) {
    std::ranges::transform(name, name.begin(),
                           [](char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 32) : c; });
    return name;
}

} // namespace

bool HtmlNode::Is(std::string_view name) const {
    return IsElement() && SameName(name_, name);
}

std::string HtmlNode::nodeName() const {
    switch (kind_) {
    case Kind::Document:
        return "#document";
    case Kind::Doctype:
        return "#doctype";
    case Kind::Text:
        return "#text";
    case Kind::Comment:
        return "#comment";
    default:
        return foreign_ ? name_ : Upper(name_);
    }
}

std::string HtmlNode::uniqueID() const {
    return "ms__id" + std::to_string(number_);
}

void HtmlNode::setNodeValue(const std::string& value) {
    value_ = value;
    source_ = {};
    Touch();
}

std::vector<HtmlNode*> HtmlNode::childNodes() const {
    std::vector<HtmlNode*> nodes;
    for (HtmlNode* child = firstChild_; child != nullptr; child = child->next_)
        nodes.push_back(child);
    return nodes;
}

std::vector<HtmlNode*> HtmlNode::children() const {
    std::vector<HtmlNode*> nodes;
    for (HtmlNode* child = firstChild_; child != nullptr; child = child->next_)
        if (child->IsElement())
            nodes.push_back(child);
    return nodes;
}

HtmlNode* HtmlNode::NextWithin(const HtmlNode& root) const {
    return firstChild_ != nullptr ? firstChild_ : NextBehind(root);
}

HtmlNode* HtmlNode::NextBehind(const HtmlNode& root) const {
    for (const HtmlNode* node = this; node != nullptr && node != &root; node = node->parent_)
        if (node->next_ != nullptr)
            return node->next_;
    return nullptr;
}

std::vector<HtmlNode*> HtmlNode::getElementsByTagName(std::string_view name) const {
    std::vector<HtmlNode*> found;
    for (HtmlNode* node = NextWithin(*this); node != nullptr; node = node->NextWithin(*this))
        if (node->IsElement() && (name == "*" || node->Is(name)))
            found.push_back(node);
    return found;
}

const HtmlAttribute* HtmlNode::FindAttribute(std::string_view name) const {
    const auto found = std::ranges::find_if(
        attributes_, [&](const HtmlAttribute& attribute) { return SameName(attribute.name, name); });
    return found == attributes_.end() ? nullptr : &*found;
}

std::optional<std::string> HtmlNode::getAttribute(std::string_view name) const {
    const HtmlAttribute* attribute = FindAttribute(name);
    return attribute == nullptr ? std::nullopt : std::optional(attribute->value);
}

void HtmlNode::setAttribute(std::string_view name, const std::string& value) {
    source_ = {};
    Touch();
    if (const HtmlAttribute* found = FindAttribute(name)) {
        HtmlAttribute& attribute = attributes_[static_cast<std::size_t>(found - attributes_.data())];
        attribute.value = value;
        attribute.text = {};
        return;
    }
    std::string lower(name);
    std::ranges::transform(lower, lower.begin(), text::LowerAscii);
    attributes_.push_back({std::move(lower), value, {}, /*specified=*/true});
}

void HtmlNode::removeAttribute(std::string_view name) {
    const HtmlAttribute* found = FindAttribute(name);
    if (found == nullptr)
        return;
    attributes_.erase(attributes_.begin() + (found - attributes_.data()));
    source_ = {};
    Touch();
}

HtmlNode& HtmlNode::insertBefore(HtmlNode& node, HtmlNode* reference) {
    bool impossible = node.document_ != document_ || (reference != nullptr && reference->parent_ != this) ||
                      node.kind_ == Kind::Document || (kind_ != Kind::Element && kind_ != Kind::Document) ||
                      &node == this;
    // What holds nothing can't hold this node: deep trees are built without a walk up for each level.
    const HtmlNode* above = node.firstChild_ == nullptr ? nullptr : parent_;
    for (; above != nullptr && !impossible; above = above->parent_)
        impossible = above == &node;
    if (impossible)
        throw RaisedError(kGeneralFailure, "The node can't be put there", "HtmlNode");
    if (reference == &node)
        return node;
    node.Detach();
    Attach(node, reference);
    Touch();
    return node;
}

void HtmlNode::removeNode(bool deep) {
    if (parent_ == nullptr)
        return;
    while (!deep && firstChild_ != nullptr)
        parent_->insertBefore(*firstChild_, this);
    Detach();
    Touch();
}

void HtmlNode::replaceNode(HtmlNode& node) {
    if (parent_ == nullptr || &node == this)
        return;
    parent_->insertBefore(node, this);
    removeNode();
}

void HtmlNode::setInnerHTML(const std::string& html) {
    while (firstChild_ != nullptr)
        firstChild_->Detach();
    Touch();
    document_->ReadFragment(html, *this, *this);
}

void HtmlNode::Detach() {
    if (parent_ == nullptr)
        return;
    (previous_ != nullptr ? previous_->next_ : parent_->firstChild_) = next_;
    (next_ != nullptr ? next_->previous_ : parent_->lastChild_) = previous_;
    parent_ = previous_ = next_ = nullptr;
}

void HtmlNode::Attach(HtmlNode& node, HtmlNode* reference) {
    node.parent_ = this;
    node.next_ = reference;
    node.previous_ = reference != nullptr ? reference->previous_ : lastChild_;
    (node.previous_ != nullptr ? node.previous_->next_ : firstChild_) = &node;
    (reference != nullptr ? reference->previous_ : lastChild_) = &node;
}

void HtmlNode::Touch() {
    ++document_->changes_;
}

} // namespace tovimar
