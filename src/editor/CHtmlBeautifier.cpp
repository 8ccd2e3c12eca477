#include "editor/CHtmlBeautifier.h"

#include "foundation/ErrorTrap.h"
#include "platform/html/HtmlDocument.h"
#include "platform/text/Text.h"

namespace tovimar {

namespace {

constexpr std::size_t kBufferSize = 100000;

/// The script by which the editor helps itself.
bool IsEditorsOwn(const HtmlNode& node) {
    return node.Is("script") && node.id() == "wbh";
}

} // namespace

void CHtmlBeautifier::SetDocument(HtmlDocument& robj) {
    document_ = &robj;
    if (!text::EqualsIgnoringCase(robj.designMode, "on"))
        robj.designMode = "on";
    formatter_ = CHtmlStringFormatter();
    formatter_.UseSourceAttributes = UseSourceAttributes;
    const auto bases = robj.getElementsByTagName("base");
    const std::string base =
        bases.empty() ? std::string() : bases.front()->getAttribute("href").value_or(std::string());
    formatter_.Page = PageAddress::Of(robj.URL, base);
}

std::string CHtmlBeautifier::EditModeReadyHTML() {
    if (document_ == nullptr)
        return {};
    CHtmlStringBuilder sb;
    sb.Init(kBufferSize);
    WriteNodes(sb, document_->Root());
    return sb.Value();
}

/// The nodes that are open are those above `node`: a page may nest deeper than a stack.
void CHtmlBeautifier::WriteNodes(CHtmlStringBuilder& sb, const HtmlNode& root) {
    std::size_t level = 1;
    const HtmlNode* node = root.firstChild();
    const auto close = [&](const HtmlNode& element) {
        Trapped("CHtmlBeautifier", "WriteNode", [&] { formatter_.addClosedChunk(sb, level, element); });
    };
    while (node != nullptr) {
        auto chunk = CHtmlStringFormatter::Chunk::Finished;
        if (!IsEditorsOwn(*node))
            Trapped("CHtmlBeautifier", "WriteNode", [&] { chunk = formatter_.AddChunk(sb, level, *node); });
        if (chunk == CHtmlStringFormatter::Chunk::Open && node->firstChild() != nullptr) {
            node = node->firstChild();
            ++level;
            continue;
        }
        if (chunk == CHtmlStringFormatter::Chunk::Open)
            close(*node);
        while (node->nextSibling() == nullptr && node->parentNode() != &root) {
            node = node->parentNode();
            --level;
            close(*node);
        }
        node = node->nextSibling();
    }
}

void CHtmlBeautifier::Dispose() {
    document_ = nullptr;
    formatter_ = CHtmlStringFormatter();
}

} // namespace tovimar
