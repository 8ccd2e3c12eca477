#include "platform/html/HtmlTreeReader.h"

#include "platform/html/GumboMemory.h"
#include "platform/html/HtmlBounds.h"
#include "platform/html/HtmlDocument.h"
#include "platform/html/WrittenText.h"
#include "platform/text/CodePoints.h"

#include <gumbo.h>

#include <algorithm>
#include <span>
#include <string>
#include <utility>

namespace tovimar {

namespace {

std::string_view Piece(const GumboStringPiece& piece) {
    return piece.data == nullptr ? std::string_view() : std::string_view(piece.data, piece.length);
}

std::span<void* const> Items(const GumboVector& vector) {
    return {vector.data, vector.length};
}

const GumboNode& NodeAt(const void* parsed) {
    return *static_cast<const GumboNode*>(parsed);
}

std::string Lower(std::string_view name) {
    std::string lower(name);
    std::ranges::transform(lower, lower.begin(), text::LowerAscii);
    return lower;
}

std::string NameOf(const GumboElement& element) {
    GumboStringPiece tag = element.original_tag;
    if (element.tag_namespace == GUMBO_NAMESPACE_SVG) {
        gumbo_tag_from_original_text(&tag);
        if (const char* name = gumbo_normalize_svg_tagname(&tag))
            return name;
    }
    if (element.tag != GUMBO_TAG_UNKNOWN)
        return gumbo_normalized_tagname(element.tag);
    tag = element.original_tag;
    gumbo_tag_from_original_text(&tag);
    return Lower(Piece(tag));
}

std::string AttributeName(const GumboAttribute& attribute) {
    switch (attribute.attr_namespace) {
    case GUMBO_ATTR_NAMESPACE_XLINK:
        return std::string("xlink:") + attribute.name;
    case GUMBO_ATTR_NAMESPACE_XML:
        return std::string("xml:") + attribute.name;
    case GUMBO_ATTR_NAMESPACE_XMLNS:
        return attribute.name == std::string_view("xmlns") ? "xmlns" : std::string("xmlns:") + attribute.name;
    default:
        return attribute.name;
    }
}

bool Holds(std::string_view whole, std::string_view part) {
    return part.data() >= whole.data() && part.data() + part.size() <= whole.data() + whole.size();
}

bool StartsTag(std::string_view tag, std::string_view opening, std::string_view name) {
    return tag.starts_with(opening) && tag.ends_with('>') && tag.size() > opening.size() + name.size() &&
           Lower(tag.substr(opening.size(), name.size())) == Lower(name);
}

/// Comments, and what browsers take for one: "<!" and "<?" with anything behind them.
bool IsFinishedComment(std::string_view source) {
    if (source.starts_with("<!--"))
        return source.ends_with("-->");
    return (source.starts_with("<!") || source.starts_with("<?")) && source.ends_with('>');
}

const GumboVector* ChildrenOf(const GumboNode& node) {
    switch (node.type) {
    case GUMBO_NODE_DOCUMENT:
        return &node.v.document.children;
    case GUMBO_NODE_ELEMENT:
    case GUMBO_NODE_TEMPLATE:
        return &node.v.element.children;
    default:
        return nullptr;
    }
}

/// A parse and the memory that its tree stands in.
class Parse {
public:
    Parse(std::string_view source, GumboTag context, GumboNamespaceEnum contextNamespace)
        : memory_(kMemoryAtLeast + kMemoryPerByte * source.size()) {
        GumboOptions options = kGumboDefaultOptions;
        options.allocator = GumboMemory::Allocate;
        options.deallocator = GumboMemory::Release;
        options.userdata = &memory_;
        options.max_errors = 0;
        options.fragment_context = context;
        options.fragment_namespace = contextNamespace;
        output_ = gumbo_parse_with_options(&options, source.data(), source.size());
    }
    const GumboOutput& Output() const { return *output_; }

private:
    /// A page of ordinary markup takes about 20 bytes for each of its own.
    static constexpr std::size_t kMemoryAtLeast = 4U * 1024 * 1024;
    static constexpr std::size_t kMemoryPerByte = 200;

    GumboMemory memory_;
    GumboOutput* output_ = nullptr;
};

} // namespace

void HtmlTreeReader::ReadDocument(HtmlNode& root) {
    CheckHtmlBounds(source_);
    const Parse parse(source_, GUMBO_TAG_LAST, GUMBO_NAMESPACE_HTML);
    Copy(parse.Output().document, root);
    if (parse.Output().document->v.document.has_doctype)
        AddDoctype(root);
    PutTailBehindBody();
    CheckTexts(root);
}

void HtmlTreeReader::ReadFragment(HtmlNode& parent, const HtmlNode& context) {
    CheckHtmlBounds(source_);
    GumboTag tag = gumbo_tag_enum(context.name().c_str());
    GumboNamespaceEnum space = GUMBO_NAMESPACE_HTML;
    if (context.IsForeign())
        space = tag == GUMBO_TAG_MATH ? GUMBO_NAMESPACE_MATHML : GUMBO_NAMESPACE_SVG;
    if (tag == GUMBO_TAG_UNKNOWN)
        tag = GUMBO_TAG_DIV;
    const Parse parse(source_, tag, space);
    Copy(parse.Output().root, parent);
    CheckTexts(parent);
}

/// Parents are kept in a list instead of on the stack.
void HtmlTreeReader::Copy(const void* parsedParent, HtmlNode& parent) {
    std::vector<std::pair<const GumboNode*, HtmlNode*>> open{{&NodeAt(parsedParent), &parent}};
    while (!open.empty()) {
        const auto [from, to] = open.back();
        open.pop_back();
        const GumboVector* children = ChildrenOf(*from);
        if (children == nullptr)
            continue;
        for (const void* child : Items(*children)) {
            HtmlNode& node = NodeOf(child);
            to->Attach(node, nullptr);
            open.emplace_back(&NodeAt(child), &node);
        }
    }
}

HtmlNode& HtmlTreeReader::NodeOf(const void* parsed) {
    const GumboNode& from = NodeAt(parsed);
    if (from.type == GUMBO_NODE_ELEMENT || from.type == GUMBO_NODE_TEMPLATE) {
        HtmlNode& node = document_.MakeNode(HtmlNode::Kind::Element);
        FillElement(node, parsed);
        return node;
    }
    if (from.type == GUMBO_NODE_COMMENT) {
        HtmlNode& node = document_.MakeNode(HtmlNode::Kind::Comment);
        node.value_ = from.v.text.text;
        node.source_ = Checked(Piece(from.v.text.original_text));
        if (!IsFinishedComment(node.source_))
            node.source_ = {};
        return node;
    }
    HtmlNode& node = document_.MakeNode(HtmlNode::Kind::Text);
    FillText(node, parsed);
    return node;
}

/// Some of the parser's places reach over the text's end, or come from nowhere.
std::string_view HtmlTreeReader::Checked(std::string_view part) const {
    return Holds(source_, part) ? part : std::string_view();
}

void HtmlTreeReader::FillElement(HtmlNode& node, const void* parsed) {
    const GumboElement& element = NodeAt(parsed).v.element;
    node.name_ = NameOf(element);
    node.foreign_ = element.tag_namespace != GUMBO_NAMESPACE_HTML;
    node.unknown_ = element.tag == GUMBO_TAG_UNKNOWN && !node.foreign_;
    FillAttributes(node, parsed);
    const std::string_view start = Checked(Piece(element.original_tag));
    // A second BODY tag, say, adds attributes to the first.
    const bool whole = std::ranges::all_of(Items(element.attributes), [&](const void* item) {
        return Holds(start, Piece(static_cast<const GumboAttribute*>(item)->original_name));
    });
    if (whole && StartsTag(start, "<", node.name_))
        node.source_ = start;
    const std::string_view end = Checked(Piece(element.original_end_tag));
    if (StartsTag(end, "</", node.name_))
        node.sourceEnd_ = end;
}

void HtmlTreeReader::FillAttributes(HtmlNode& node, const void* parsed) {
    for (const void* item : Items(NodeAt(parsed).v.element.attributes)) {
        const auto& attribute = *static_cast<const GumboAttribute*>(item);
        node.attributes_.push_back({AttributeName(attribute), attribute.value,
                                    Checked(Piece(attribute.original_value)), /*specified=*/true});
    }
}

void HtmlTreeReader::FillText(HtmlNode& node, const void* parsed) {
    const GumboText& text = NodeAt(parsed).v.text;
    node.value_ = text.text;
    node.source_ = Checked(Piece(text.original_text));
    // A line end is one character for the parser, and its place that of the second.
    const char* start = node.source_.data();
    if (node.source_.starts_with('\n') && start != source_.data() && start[-1] == '\r')
        node.source_ = {start - 1, node.source_.size() + 1};
    if (NodeAt(parsed).type == GUMBO_NODE_CDATA)
        node.source_ = {};
}

/// The parser joins texts on both sides of a tag that it drops, and tells where they end by what comes next:
/// only what reads as the text is how it was written.
void HtmlTreeReader::CheckTexts(const HtmlNode& root) {
    for (HtmlNode* node = root.NextWithin(root); node != nullptr; node = node->NextWithin(root)) {
        if (!node->IsText())
            continue;
        const HtmlNode& parent = *node->parentNode();
        const bool raw = parent.IsElement() && !parent.IsForeign() && IsRawTextElement(parent.name());
        if (!raw)
            node->source_ = node->source_.substr(0, node->source_.find('<'));
        if (raw ? !IsTextWithLineEnds(node->value_, node->source_)
                : !IsWrittenAs(node->value_, node->source_))
            node->source_ = {};
    }
}

/// The parser tells the parts of a document type but not how it was written.
void HtmlTreeReader::AddDoctype(HtmlNode& root) {
    constexpr std::string_view kOpening = "<!doctype";
    HtmlNode* behind = root.firstChild();
    std::size_t begin = source_.find('<');
    while (begin != std::string_view::npos && Lower(source_.substr(begin, kOpening.size())) != kOpening) {
        const bool comment = source_.substr(begin).starts_with("<!--");
        begin = source_.find('<', comment ? source_.find("-->", begin + 2) : begin + 1);
        if (behind != nullptr && behind->kind() == HtmlNode::Kind::Comment)
            behind = behind->nextSibling();
    }
    const std::size_t end = begin == std::string_view::npos ? begin : source_.find('>', begin);
    if (end == std::string_view::npos)
        return;
    HtmlNode& node = document_.MakeNode(HtmlNode::Kind::Doctype);
    node.source_ = source_.substr(begin, end + 1 - begin);
    root.Attach(node, behind);
}

/// The parser puts the line ends behind the body's end into the body: every saving of the page would add to
/// it.
void HtmlTreeReader::PutTailBehindBody() {
    HtmlNode* body = document_.body();
    if (body == nullptr || body->SourceEnd().empty() || body->parentNode() == nullptr)
        return;
    const auto bodyEnd = static_cast<std::size_t>(body->SourceEnd().data() - source_.data());
    std::size_t spaces = SpacesOutsideTags(source_.substr(bodyEnd));
    std::string tail;
    // A comment between them makes them two texts.
    while (spaces > 0 && body->lastChild() != nullptr && body->lastChild()->IsText()) {
        const std::string cut = CutSpaces(*body->lastChild(), spaces);
        if (cut.empty())
            break;
        spaces -= cut.size();
        tail.insert(0, cut);
    }
    if (tail.empty())
        return;
    HtmlNode& node = document_.MakeNode(HtmlNode::Kind::Text);
    node.value_ = std::move(tail);
    body->parentNode()->Attach(node, body->nextSibling());
}

/// Takes at most so many blanks off a text's end; a text that is left without any goes.
std::string HtmlTreeReader::CutSpaces(HtmlNode& node, std::size_t most) {
    const std::size_t shown = node.value_.find_last_not_of(" \t\n\f");
    const std::size_t blank = shown == std::string::npos ? 0 : shown + 1;
    const std::size_t kept = std::max(blank, node.value_.size() - std::min(most, node.value_.size()));
    std::string cut = node.value_.substr(kept);
    if (cut.empty())
        return cut;
    node.value_.resize(kept);
    if (kept == 0)
        node.Detach();
    return cut;
}

} // namespace tovimar
