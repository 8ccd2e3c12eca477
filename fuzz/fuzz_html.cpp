// Pages come from writers and any tool: whatever their bytes, a page is read or refused with a reason, can be
// changed, gives its text and is written, as it was and neat. A page in one piece is written back whole.

#include "QuietSurroundings.h"
#include "editor/CHtmlBeautifier.h"
#include "platform/Error.h"
#include "platform/html/HtmlDocument.h"

#include <string>

namespace {

using tovimar::HtmlDocument;
using tovimar::HtmlNode;

/// Every link between two nodes has its other direction.
void CheckLinks(const HtmlNode& root) {
    for (const HtmlNode* node = &root; node != nullptr; node = node->NextWithin(root)) {
        const HtmlNode* before = nullptr;
        for (const HtmlNode* child = node->firstChild(); child != nullptr; child = child->nextSibling()) {
            if (child->parentNode() != node || child->previousSibling() != before)
                __builtin_trap();
            before = child;
        }
        if (node->lastChild() != before)
            __builtin_trap();
    }
}

std::string Neat(HtmlDocument& document, bool sourceAttributes) {
    tovimar::CHtmlBeautifier beautifier;
    beautifier.UseSourceAttributes = sourceAttributes;
    beautifier.SetDocument(document);
    return beautifier.EditModeReadyHTML();
}

void Change(HtmlDocument& document, const std::string& part) {
    const auto elements = document.all();
    HtmlNode& middle = *elements[elements.size() / 2];
    HtmlNode& last = *elements.back();
    middle.setInnerHTML(part);
    last.setAttribute("title", part);
    last.removeNode(/*deep=*/part.size() % 2 == 0);
    if (HtmlNode* body = document.body())
        body->appendChild(document.createElement("p")).appendChild(document.createTextNode(part));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    const std::string page(tovimar::fuzz::Text(data, size));
    try {
        HtmlDocument document(page, "file:///C:/Help/html/page.htm");
        CheckLinks(document.Root());
        document.body()->innerText();
        document.outerHTML();
        HtmlDocument neat(Neat(document, /*sourceAttributes=*/size % 2 == 0));
        Change(document, page.substr(0, page.size() / 4));
        CheckLinks(document.Root());
        Neat(document, /*sourceAttributes=*/size % 2 != 0);
        document.outerHTML();
    } catch (const tovimar::RaisedError&) {
        return 0;
    }
    return 0;
}
