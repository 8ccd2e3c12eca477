#include "platform/html/HtmlWriter.h"

#include "platform/html/HtmlNode.h"

namespace tovimar {

namespace {

/// The first line end in such an element is taken off when it is read.
bool LosesFirstLineEnd(const HtmlNode& node) {
    return (node.Is("pre") || node.Is("textarea") || node.Is("listing")) && node.firstChild() != nullptr &&
           node.firstChild()->IsText() && node.firstChild()->nodeValue().starts_with('\n');
}

/// An element of a drawing that is closed in its start tag.
bool ClosesInStartTag(const HtmlNode& node) {
    return node.IsForeign() && node.firstChild() == nullptr && node.SourceStart().ends_with("/>");
}

/// Of a character whose first byte is 0xC2: U+0080 to U+00BF.
std::string SecondControlOrBlank(std::string_view character, bool quotes) {
    if (character.size() < 2)
        return {};
    const auto number = static_cast<unsigned char>(character[1]);
    if (number < 0xA0)
        return "&#" + std::to_string(number) + ";";
    return number == 0xA0 && !quotes ? "&nbsp;" : "";
}

std::string EntityOf(std::string_view text, std::size_t position, bool quotes) {
    switch (text[position]) {
    case '&':
        return "&amp;";
    case '<':
        return "&lt;";
    case '>':
        return "&gt;";
    case '"':
        return quotes ? "&quot;" : "";
    case '\xC2':
        return SecondControlOrBlank(text.substr(position, 2), quotes);
    default:
        return {};
    }
}

} // namespace

void AppendEncoded(std::string& out, std::string_view text, bool quotes) {
    std::size_t done = 0;
    for (std::size_t i = text.find_first_of("&<>\"\xC2"); i != std::string_view::npos;
         i = text.find_first_of("&<>\"\xC2", i + 1)) {
        const std::string entity = EntityOf(text, i, quotes);
        if (entity.empty())
            continue;
        out.append(text, done, i - done).append(entity);
        done = i + (text[i] == '\xC2' ? 2 : 1);
    }
    out.append(text, done);
}

std::string_view WrittenName(const HtmlNode& node) {
    return node.Is("plaintext") ? std::string_view("pre") : std::string_view(node.name());
}

void HtmlWriter::Write(const HtmlNode& node) {
    WriteStart(node);
    if (node.kind() != HtmlNode::Kind::Document && !node.IsElement())
        return;
    WriteChildren(node);
    WriteEnd(node);
}

void HtmlWriter::WriteChildren(const HtmlNode& parent) {
    const HtmlNode* node = parent.firstChild();
    while (node != nullptr) {
        WriteStart(*node);
        if (node->firstChild() != nullptr) {
            node = node->firstChild();
            continue;
        }
        WriteEnd(*node);
        while (node->nextSibling() == nullptr && node->parentNode() != &parent) {
            node = node->parentNode();
            WriteEnd(*node);
        }
        node = node->nextSibling();
    }
}

void HtmlWriter::WriteStart(const HtmlNode& node) {
    if (!node.IsElement()) {
        WriteOther(node);
        return;
    }
    if (!node.SourceStart().empty() && !node.Is("plaintext")) {
        out_.append(node.SourceStart());
    } else {
        out_.append("<").append(WrittenName(node));
        for (const HtmlAttribute& attribute : node.attributes()) {
            out_.append(" ").append(attribute.name);
            if (!attribute.text.empty()) {
                out_.append("=").append(attribute.text);
                continue;
            }
            out_.append("=\"");
            AppendEncoded(out_, attribute.value, /*quotes=*/true);
            out_.append("\"");
        }
        out_.append(">");
    }
    if (LosesFirstLineEnd(node))
        out_.append("\r\n");
}

void HtmlWriter::WriteOther(const HtmlNode& node) {
    if (node.kind() == HtmlNode::Kind::Document)
        return;
    const bool asWritten = node.parentNode() == nullptr || !node.parentNode()->Is("plaintext");
    if (asWritten && !node.SourceStart().empty())
        out_.append(node.SourceStart());
    else if (node.IsText())
        WriteText(node);
    else if (node.kind() == HtmlNode::Kind::Comment)
        out_.append("<!--").append(node.nodeValue()).append("-->");
    // Line ends in front of the element HTML are no nodes.
    const HtmlNode* parent = node.parentNode();
    if (parent != nullptr && parent->kind() == HtmlNode::Kind::Document && node.nextSibling() != nullptr)
        out_.append("\r\n");
}

void HtmlWriter::WriteText(const HtmlNode& node) {
    const HtmlNode* parent = node.parentNode();
    std::string text;
    if (parent != nullptr && !parent->IsForeign() && IsRawTextElement(parent->name()) &&
        !parent->Is("plaintext"))
        text = node.nodeValue();
    else
        AppendEncoded(text, node.nodeValue(), /*quotes=*/false);
    for (const char c : text) {
        if (c == '\n' && !out_.ends_with('\r'))
            out_ += '\r';
        out_ += c;
    }
}

void HtmlWriter::WriteEnd(const HtmlNode& node) {
    if (!node.IsElement() || IsVoidElement(node.name()) || ClosesInStartTag(node))
        return;
    if (!node.SourceEnd().empty())
        out_.append(node.SourceEnd());
    else
        out_.append("</").append(WrittenName(node)).append(">");
}

std::string HtmlNode::outerHTML() const {
    std::string out;
    HtmlWriter(out).Write(*this);
    return out;
}

std::string HtmlNode::innerHTML() const {
    std::string out;
    HtmlWriter(out).WriteChildren(*this);
    return out;
}

std::string HtmlNode::startTag() const {
    std::string out;
    if (IsElement())
        HtmlWriter(out).WriteStart(*this);
    return out;
}

} // namespace tovimar
