#include "platform/html/HtmlNode.h"

#include <string>

namespace tovimar {

namespace {

bool IsSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\f';
}

/// Joins the texts of a page as they show.
class ShownText {
public:
    void Add(std::string_view text, bool preformatted) {
        for (const char c : text) {
            if (c == '\n' && preformatted)
                Break();
            else if (IsSpace(c) && !preformatted)
                blank_ = true;
            else if (c != '\r')
                AddCharacter(c);
        }
    }
    /// A line end that stands whatever is before it.
    void Break() {
        blank_ = false;
        ++breaks_;
    }
    /// A line end unless one stands here.
    void BlockEdge() {
        blank_ = false;
        if (breaks_ == 0)
            breaks_ = 1;
    }
    std::string Take() { return std::move(out_); }

private:
    void AddCharacter(char c) {
        // Line ends and blanks at the edges of the whole show nothing.
        for (; breaks_ > 0; --breaks_)
            if (!out_.empty())
                out_ += "\r\n";
        if (blank_ && !out_.empty() && out_.back() != '\n')
            out_ += ' ';
        blank_ = false;
        out_ += c;
    }

    std::string out_;
    bool blank_ = false;
    std::size_t breaks_ = 0;
};

bool IsShown(const HtmlNode& node) {
    return !(node.Is("script") || node.Is("style") || node.Is("title") || node.Is("template"));
}

/// Blocks among those that begin a line, but not those that don't show.
bool StandsAlone(const HtmlNode& node) {
    return node.IsElement() && IsBlockElement(node.name());
}

} // namespace

std::string HtmlNode::innerText() const {
    if (IsText())
        return value_;
    ShownText shown;
    int preformatted = IsElement() && IsPreformattedElement(name_) ? 1 : 0;
    const auto enter = [&](const HtmlNode& node) {
        if (node.IsText())
            shown.Add(node.nodeValue(), preformatted > 0);
        else if (node.Is("br"))
            shown.Break();
        else if (StandsAlone(node))
            shown.BlockEdge();
        preformatted += node.IsElement() && IsPreformattedElement(node.name()) ? 1 : 0;
    };
    const auto leave = [&](const HtmlNode& node) {
        preformatted -= node.IsElement() && IsPreformattedElement(node.name()) ? 1 : 0;
        if (StandsAlone(node))
            shown.BlockEdge();
    };
    const HtmlNode* node = firstChild_;
    while (node != nullptr) {
        enter(*node);
        if (node->firstChild() != nullptr && IsShown(*node)) {
            node = node->firstChild();
            continue;
        }
        leave(*node);
        while (node->nextSibling() == nullptr && node->parentNode() != this) {
            node = node->parentNode();
            leave(*node);
        }
        node = node->nextSibling();
    }
    return shown.Take();
}

std::string HtmlNode::textContent() const {
    if (!IsElement() && kind_ != Kind::Document)
        return value_;
    std::string out;
    for (const HtmlNode* node = NextWithin(*this); node != nullptr; node = node->NextWithin(*this))
        if (node->IsText())
            out += node->nodeValue();
    return out;
}

} // namespace tovimar
