#include "editor/CHtmlStringFormatter.h"

#include "editor/ElementLists.h"
#include "platform/html/HtmlNode.h"
#include "platform/html/HtmlWriter.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar {

namespace {

/// Deeper levels stand below each other: pages may nest by the thousand.
constexpr std::size_t kMostLevelsIndented = 64;

std::string Indent(std::size_t level) {
    return std::string(2 * std::min(level, kMostLevelsIndented), ' ');
}

bool IsSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\f';
}

bool IsBlank(std::string_view text) {
    return std::ranges::all_of(text, IsSpace);
}

/// Each line end as CRLF.
std::string WithCrLf(std::string_view text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == '\n' && !out.ends_with('\r'))
            out += '\r';
        out += text[i];
        if (text[i] == '\r' && !text.substr(i + 1).starts_with("\n"))
            out += '\n';
    }
    return out;
}

std::string Encoded(std::string_view text, bool attribute) {
    std::string out;
    AppendEncoded(out, text, attribute);
    return WithCrLf(out);
}

/// The only input of a form that stands for an ISINDEX: the parser reads one as such a form.
const HtmlNode* IsIndexInput(const HtmlNode& form) {
    const auto inputs = form.getElementsByTagName("input");
    if (inputs.size() != 1)
        return nullptr;
    const std::string name = inputs.front()->getAttribute("name").value_or(std::string());
    return text::EqualsIgnoringCase(name, "isindex") ? inputs.front() : nullptr;
}

/// Runs of white space as one blank each.
std::string Joined(std::string_view text) {
    std::string out;
    for (const char c : text)
        if (!IsSpace(c))
            out += c;
        else if (!out.ends_with(' '))
            out += ' ';
    return out;
}

/// No text shows behind it on its line.
bool EndsItsLine(const HtmlNode& node) {
    const HtmlNode* next = node.nextSibling();
    const HtmlNode* edge = next != nullptr ? next : node.parentNode();
    if (next == nullptr && edge != nullptr && edge->Is("select"))
        return true;
    return edge != nullptr && edge->IsElement() && IsBlockElement(edge->name());
}

} // namespace

CHtmlStringFormatter::Chunk CHtmlStringFormatter::AddChunk(CHtmlStringBuilder& sb, std::size_t level,
                                                           const HtmlNode& node) {
    if (isIndex_ != nullptr)
        return Chunk::Open;
    const std::string indent = Indent(level - 1);
    if (node.IsText()) {
        WriteText(sb, indent, node);
        return Chunk::Finished;
    }
    if (!node.IsElement()) {
        WriteComment(sb, node);
        return Chunk::Finished;
    }
    if (node.Is("xml")) {
        WriteIsland(sb, indent, node);
        return Chunk::Finished;
    }
    const HtmlNode* input = node.Is("form") ? IsIndexInput(node) : nullptr;
    if (input != nullptr) {
        BeginIsIndex(sb, indent, node, *input);
        return Chunk::Open;
    }
    WriteElement(sb, level, node);
    return IsLeaf(node) ? Chunk::Finished : Chunk::Open;
}

void CHtmlStringFormatter::WriteText(CHtmlStringBuilder& sb, const std::string& indent,
                                     const HtmlNode& node) {
    const std::string text = preformatted_ > 0 ? node.nodeValue() : ShownText(node);
    if (text.empty() || (preformatted_ == 0 && sb.LastTokenIsCrLf() && IsBlank(text)))
        return;
    if (preformatted_ == 0 && sb.LastTokenIsCrLf())
        sb.AddString(indent);
    sb.AddString(Encoded(text, /*attribute=*/false));
    lastNode_ = "#text";
    lastWasBlank_ = preformatted_ == 0 && text == " ";
    atEdge_ = false;
}

/// White space as it shows: joined, and none at the beginning and the end of a line.
std::string CHtmlStringFormatter::ShownText(const HtmlNode& node) const {
    std::string text = Joined(node.nodeValue());
    if (atEdge_ && text.starts_with(' '))
        text.erase(0, 1);
    if (text.ends_with(' ') && EndsItsLine(node))
        text.pop_back();
    return text;
}

void CHtmlStringFormatter::WriteComment(CHtmlStringBuilder& sb, const HtmlNode& node) {
    std::string text(node.SourceStart());
    if (text.empty())
        text = node.kind() == HtmlNode::Kind::Doctype ? "<!DOCTYPE html>" : "<!--" + node.nodeValue() + "-->";
    const bool ownLine = MayBreak(sb);
    if (ownLine)
        sb.RemoveTrailingVbCrLf();
    sb.AddString(WithCrLf(text), ownLine);
    lastNode_ = "#comment";
    lastWasBlank_ = false;
}

void CHtmlStringFormatter::WriteIsland(CHtmlStringBuilder& sb, const std::string& indent,
                                       const HtmlNode& node) {
    if (sb.LastTokenIsCrLf())
        sb.AddString(indent);
    std::string island = node.outerHTML();
    CHtmlStringBuilder::formatString(island, indent);
    sb.AddString(island);
    lastNode_ = "XML";
    lastWasBlank_ = false;
}

void CHtmlStringFormatter::BeginIsIndex(CHtmlStringBuilder& sb, const std::string& indent,
                                        const HtmlNode& form, const HtmlNode& input) {
    WriteOpening(sb, indent, "isindex");
    lastNode_ = "isindex";
    std::string prompt = form.textContent();
    std::erase_if(prompt, [](char c) { return c == '\r' || c == '\n'; });
    sb.AddString(" prompt=\"" + Encoded(prompt, /*attribute=*/true) + "\"");
    for (const HtmlAttribute& attribute : input.attributes())
        if (attribute.name != "name" && attribute.name != "prompt")
            WriteAttribute(sb, indent, input, attribute);
    sb.AddString(">");
    isIndex_ = &form;
    atEdge_ = true;
}

void CHtmlStringFormatter::WriteElement(CHtmlStringBuilder& sb, std::size_t level, const HtmlNode& node) {
    const std::string inner = Indent(level);
    WriteOpening(sb, Indent(level - 1), WrittenName(node));
    lastNode_ = node.name();
    lastWasBlank_ = false;
    WriteAttributes(sb, inner, node);
    sb.AddString(">");
    NoteEdge(node);
    if (preformatted_ == 0 && IsFormattedBlock(node.name()))
        BreakLine(sb);
    preformatted_ += ShowsWhiteSpace(node) ? 1 : 0;
    const HtmlNode* first = node.firstChild();
    if (preformatted_ > 0 && IsPreformattedElement(node.name()) && first != nullptr && first->IsText() &&
        first->nodeValue().starts_with('\n'))
        sb.AddString("\r\n"); // readers take the first one off
    if (IsLeaf(node)) {
        WriteContent(sb, inner, node);
        addClosedChunk(sb, level + 1, node);
    }
}

/// A line end in front, unless it would put a blank into running text; "br" and "a" run on in their line.
void CHtmlStringFormatter::WriteOpening(CHtmlStringBuilder& sb, const std::string& indent,
                                        std::string_view name) {
    const bool runsOn = name == "br" || name == "a";
    if (preformatted_ == 0 && runsOn) {
        if (lastNode_ == "#comment" || IsFormattedBlock(lastNode_))
            sb.AddString(sb.LastTokenIsCrLf() ? indent : std::string());
        else
            sb.RemoveTrailingVbCrLf();
    } else if (preformatted_ == 0 && (IsBlockElement(name) || MayBreak(sb))) {
        if (lastWasBlank_)
            sb.RemoveTrailingBlank();
        BreakLine(sb);
        sb.AddString(indent);
    }
    sb.AddString("<");
    sb.AddString(name);
}

void CHtmlStringFormatter::BreakLine(CHtmlStringBuilder& sb) {
    sb.RemoveTrailingVbCrLf();
    if (!sb.IsEmpty())
        sb.AddString("\r\n");
}

bool CHtmlStringFormatter::MayBreak(const CHtmlStringBuilder& sb) const {
    return preformatted_ == 0 && (atEdge_ || sb.IsEmpty() || sb.EndsInSpace());
}

void CHtmlStringFormatter::NoteEdge(const HtmlNode& node) {
    const bool opensList = node.Is("select") && !closed_.contains(node.uniqueID());
    if (IsBlockElement(node.name()) || node.Is("br") || opensList)
        atEdge_ = true;
    else if (ShowsByItself(node.name()))
        atEdge_ = false;
}

/// The text of elements that hold no nodes of their own to write.
void CHtmlStringFormatter::WriteContent(CHtmlStringBuilder& sb, const std::string& indent,
                                        const HtmlNode& node) {
    std::string content = node.textContent();
    if (content.empty() || (IsFormattedBlock(node.name()) && IsBlank(content)))
        return;
    if (node.Is("plaintext")) {
        sb.AddString(Encoded(content, /*attribute=*/false));
        return;
    }
    if (ShowsWhiteSpace(node)) {
        sb.AddString(WithCrLf(content));
        return;
    }
    CHtmlStringBuilder::formatString(content, indent);
    if (sb.LastTokenIsCrLf() && content.starts_with("\r\n"))
        sb.RemoveTrailingVbCrLf();
    else if (sb.LastTokenIsCrLf())
        sb.AddString(indent);
    sb.AddString(content);
}

void CHtmlStringFormatter::addClosedChunk(CHtmlStringBuilder& sb, std::size_t level, const HtmlNode& node) {
    if (isIndex_ != nullptr) {
        if (isIndex_ == &node)
            isIndex_ = nullptr;
        return;
    }
    if (node.IsElement())
        WriteClosing(sb, Indent(level - 1), node);
}

void CHtmlStringFormatter::WriteClosing(CHtmlStringBuilder& sb, const std::string& indent,
                                        const HtmlNode& node) {
    const std::string_view name = node.name();
    if (!closed_.insert(node.uniqueID()).second)
        return;
    const bool free = preformatted_ == 0;
    preformatted_ -= ShowsWhiteSpace(node) ? 1 : 0;
    if (IsVoidElement(name))
        return;
    if (free && IsFormattedBlock(name)) {
        BreakLine(sb);
        sb.AddString(indent);
    } else if (free && !IsInlineCloser(name) && sb.LastTokenIsCrLf()) {
        sb.AddString(indent);
    }
    sb.AddString("</");
    sb.AddString(WrittenName(node));
    sb.AddString(">");
    lastWasBlank_ = false;
    NoteEdge(node);
}

} // namespace tovimar
