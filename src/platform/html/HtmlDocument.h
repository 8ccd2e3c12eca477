#pragma once

#include "platform/html/HtmlNode.h"

#include <cstdint>
#include <deque>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

/// A page as a tree that can be changed, read by the rules by which browsers read HTML: every text is a page.
/// Pages of more than 64 MiB or 2,000 levels, and those that would grow out of all proportion when they are
/// put right, aren't read: kFailure1 is raised with the reason.
/// White space behind the body's end stays behind it.
class HtmlDocument {
public:
    HtmlDocument();
    /// `url`: path or address of the page.
    explicit HtmlDocument(std::string_view html, const std::string& url = {});
    ~HtmlDocument();
    HtmlDocument(const HtmlDocument&) = delete;
    HtmlDocument& operator=(const HtmlDocument&) = delete;

    std::string URL;
    std::string designMode = "Off";
    /// A page is read when it is made.
    std::string readyState() const { return "complete"; }

    /// The root of all: document type, comments, the element HTML.
    HtmlNode& Root() const { return *root_; }
    HtmlNode* documentElement() const;
    HtmlNode* head() const;
    /// BODY, or the FRAMESET that stands for it.
    HtmlNode* body() const;

    std::vector<HtmlNode*> all() const { return getElementsByTagName("*"); }
    std::vector<HtmlNode*> getElementsByTagName(std::string_view name) const;
    /// Null when there is none; the first of several.
    HtmlNode* getElementById(std::string_view id) const;
    /// A with a name or an id.
    std::vector<HtmlNode*> anchors() const;
    /// A and AREA with an address.
    std::vector<HtmlNode*> links() const;
    std::vector<HtmlNode*> images() const { return getElementsByTagName("IMG"); }

    /// A name, or an element's markup: "<A name='x'></A>". Raises kFailure1 for what is neither.
    HtmlNode& createElement(const std::string& tag);
    HtmlNode& createTextNode(const std::string& text);
    HtmlNode& createComment(const std::string& text);

    /// The whole page, what stands before the element HTML included.
    std::string outerHTML() const;
    /// Changes since the page was read.
    std::uint64_t Changes() const { return changes_; }
    /// The page's text, into which the nodes' sources point.
    std::string_view Source() const { return sources_.front(); }

private:
    friend class HtmlNode;
    friend class HtmlTreeReader;

    HtmlNode& MakeNode(HtmlNode::Kind kind);
    /// Reads what stands in an element and puts it behind `parent`'s children.
    void ReadFragment(std::string_view html, HtmlNode& parent, const HtmlNode& context);

    std::deque<std::string> sources_;
    std::deque<HtmlNode> nodes_;
    HtmlNode* root_ = nullptr;
    std::uint64_t changes_ = 0;
};

} // namespace tovimar
