#include "platform/html/HtmlDocument.h"

#include "platform/Error.h"
#include "platform/html/HtmlTreeReader.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar {

namespace {

/// Names that a start tag can hold.
bool IsElementName(std::string_view name) {
    const auto begins = [](char c) { return text::LowerAscii(c) >= 'a' && text::LowerAscii(c) <= 'z'; };
    return !name.empty() && begins(name.front()) &&
           name.find_first_of(" \t\r\n\f/><&\"'=") == std::string_view::npos;
}

HtmlNode* ChildNamed(const HtmlNode* parent, std::string_view name) {
    for (HtmlNode* child = parent == nullptr ? nullptr : parent->firstChild(); child != nullptr;
         child = child->nextSibling())
        if (child->Is(name))
            return child;
    return nullptr;
}

} // namespace

HtmlDocument::HtmlDocument() : HtmlDocument(std::string_view()) {}

HtmlDocument::HtmlDocument(std::string_view html, const std::string& url) : URL(url) {
    sources_.push_back(text::MakeValidUtf8(html));
    root_ = &MakeNode(HtmlNode::Kind::Document);
    HtmlTreeReader(*this, sources_.front()).ReadDocument(*root_);
}

HtmlDocument::~HtmlDocument() = default;

HtmlNode& HtmlDocument::MakeNode(HtmlNode::Kind kind) {
    HtmlNode& node = nodes_.emplace_back();
    node.document_ = this;
    node.kind_ = kind;
    node.number_ = static_cast<std::uint32_t>(nodes_.size());
    return node;
}

HtmlNode* HtmlDocument::documentElement() const {
    return ChildNamed(root_, "html");
}

HtmlNode* HtmlDocument::head() const {
    return ChildNamed(documentElement(), "head");
}

HtmlNode* HtmlDocument::body() const {
    HtmlNode* body = ChildNamed(documentElement(), "body");
    return body != nullptr ? body : ChildNamed(documentElement(), "frameset");
}

std::vector<HtmlNode*> HtmlDocument::getElementsByTagName(std::string_view name) const {
    return root_->getElementsByTagName(name);
}

HtmlNode* HtmlDocument::getElementById(std::string_view id) const {
    for (HtmlNode* node = root_; node != nullptr; node = node->NextWithin(*root_)) {
        const HtmlAttribute* attribute = node->FindAttribute("id");
        if (attribute != nullptr && attribute->value == id)
            return node;
    }
    return nullptr;
}

std::vector<HtmlNode*> HtmlDocument::anchors() const {
    std::vector<HtmlNode*> found = getElementsByTagName("a");
    std::erase_if(found, [](const HtmlNode* node) {
        return node->FindAttribute("name") == nullptr && node->FindAttribute("id") == nullptr;
    });
    return found;
}

std::vector<HtmlNode*> HtmlDocument::links() const {
    std::vector<HtmlNode*> found = all();
    std::erase_if(found, [](const HtmlNode* node) {
        return !(node->Is("a") || node->Is("area")) || node->FindAttribute("href") == nullptr;
    });
    return found;
}

HtmlNode& HtmlDocument::createElement(const std::string& tag) {
    if (tag.starts_with('<')) {
        HtmlNode& holder = createElement("div");
        ReadFragment(tag, holder, holder);
        if (const auto elements = holder.children(); !elements.empty()) {
            elements.front()->removeNode();
            return *elements.front();
        }
    }
    if (!IsElementName(tag))
        throw RaisedError(kFailure1, "'" + tag + "' isn't the name of an element", "HtmlDocument");
    HtmlNode& node = MakeNode(HtmlNode::Kind::Element);
    node.name_ = tag;
    std::ranges::transform(node.name_, node.name_.begin(), text::LowerAscii);
    return node;
}

HtmlNode& HtmlDocument::createTextNode(const std::string& text) {
    HtmlNode& node = MakeNode(HtmlNode::Kind::Text);
    node.value_ = text;
    return node;
}

HtmlNode& HtmlDocument::createComment(const std::string& text) {
    HtmlNode& node = MakeNode(HtmlNode::Kind::Comment);
    node.value_ = text;
    return node;
}

void HtmlDocument::ReadFragment(std::string_view html, HtmlNode& parent, const HtmlNode& context) {
    sources_.push_back(text::MakeValidUtf8(html));
    HtmlTreeReader(*this, sources_.back()).ReadFragment(parent, context);
}

std::string HtmlDocument::outerHTML() const {
    return root_->innerHTML();
}

} // namespace tovimar
