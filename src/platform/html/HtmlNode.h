#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

class HtmlDocument;

/// An attribute of an element. Its name is lower case but for those of drawings and formulas.
struct HtmlAttribute {
    std::string name;
    std::string value;     ///< with its entities decoded; addresses as they were written, never resolved
    std::string_view text; ///< the value in the source, quotes and entities included; empty when it was set
    bool specified = true; ///< stood in the source or was set
};

/// A node of a page. Owned by its document, which keeps it, with its identity, until it goes itself: a node
/// that is taken out can be put in elsewhere. Nothing here recurses: a page may nest as deep as it likes.
class HtmlNode {
public:
    enum class Kind : std::uint8_t { Document, Doctype, Element, Text, Comment };

    Kind kind() const { return kind_; }
    bool IsElement() const { return kind_ == Kind::Element; }
    bool IsText() const { return kind_ == Kind::Text; }
    /// An element of the name, compared without regard to ASCII case.
    bool Is(std::string_view name) const;
    /// Upper case of an element of HTML; "#text", "#comment", "#document", "#doctype".
    std::string nodeName() const;
    /// An element's name in lower case, as far as it is one of HTML.
    const std::string& name() const { return name_; }
    /// An element that no standard knows.
    bool IsUnknown() const { return unknown_; }
    /// An element of a drawing or a formula.
    bool IsForeign() const { return foreign_; }
    HtmlDocument& ownerDocument() const { return *document_; }
    /// Never the same for two nodes of a document.
    std::string uniqueID() const;

    /// A text's characters; a comment's without its marks.
    const std::string& nodeValue() const { return value_; }
    void setNodeValue(const std::string& value);

    HtmlNode* parentNode() const { return parent_; }
    HtmlNode* firstChild() const { return firstChild_; }
    HtmlNode* lastChild() const { return lastChild_; }
    HtmlNode* nextSibling() const { return next_; }
    HtmlNode* previousSibling() const { return previous_; }
    std::vector<HtmlNode*> childNodes() const;
    /// Child elements.
    std::vector<HtmlNode*> children() const;
    /// The node behind this one in the order of the source, below `root`; null behind the last.
    HtmlNode* NextWithin(const HtmlNode& root) const;
    /// The same, passing this node's children over.
    HtmlNode* NextBehind(const HtmlNode& root) const;
    /// Elements below this one, in the order of the source; "*" for all.
    std::vector<HtmlNode*> getElementsByTagName(std::string_view name) const;

    const std::vector<HtmlAttribute>& attributes() const { return attributes_; }
    const HtmlAttribute* FindAttribute(std::string_view name) const;
    /// The value as the writer wrote it, not made absolute; none when absent.
    std::optional<std::string> getAttribute(std::string_view name) const;
    void setAttribute(std::string_view name, const std::string& value);
    void removeAttribute(std::string_view name);
    std::string id() const { return getAttribute("id").value_or(std::string()); }

    /// Puts `node` in, out of where it was. Raises kGeneralFailure for a node of another document and for
    /// one that holds this node.
    HtmlNode& appendChild(HtmlNode& node) { return insertBefore(node, nullptr); }
    /// Before the child `reference`, or at the end.
    HtmlNode& insertBefore(HtmlNode& node, HtmlNode* reference);
    /// Takes this node out; without `deep` its children take its place.
    void removeNode(bool deep = true);
    /// Puts `node` in this one's place.
    void replaceNode(HtmlNode& node);

    /// The element with all in it. What wasn't changed is given as it was written; end tags that were left
    /// out are put in.
    std::string outerHTML() const;
    std::string innerHTML() const;
    /// Replaces all children by what `html` says in this element.
    void setInnerHTML(const std::string& html);
    /// The start tag alone.
    std::string startTag() const;
    /// The text as it shows: white space joined, CRLF between blocks and at breaks; no scripts, no styles.
    std::string innerText() const;
    /// All characters below the node as they stand.
    std::string textContent() const;

    /// Where the tags or the text stand in the page's text; null data for what wasn't written there.
    std::string_view SourceStart() const { return source_; }
    std::string_view SourceEnd() const { return sourceEnd_; }

private:
    friend class HtmlDocument;
    friend class HtmlTreeReader;
    friend class HtmlWriter;

    void Detach();
    void Attach(HtmlNode& node, HtmlNode* reference);
    void Touch();

    HtmlDocument* document_ = nullptr;
    HtmlNode* parent_ = nullptr;
    HtmlNode* firstChild_ = nullptr;
    HtmlNode* lastChild_ = nullptr;
    HtmlNode* previous_ = nullptr;
    HtmlNode* next_ = nullptr;
    std::string name_;
    std::string value_;
    std::vector<HtmlAttribute> attributes_;
    std::string_view source_;    ///< start tag, text, comment or doctype; empty once it is changed
    std::string_view sourceEnd_; ///< end tag
    std::uint32_t number_ = 0;
    Kind kind_ = Kind::Element;
    bool unknown_ = false;
    bool foreign_ = false;
};

/// Elements that hold nothing and have no end tag.
bool IsVoidElement(std::string_view name);
/// Elements whose text is no markup and knows no entities: scripts, styles.
bool IsRawTextElement(std::string_view name);
/// Elements whose white space shows as it stands.
bool IsPreformattedElement(std::string_view name);
/// Elements that begin a line of their own when they are shown: white space beside their tags means nothing.
bool IsBlockElement(std::string_view name);

} // namespace tovimar
