// Pages come from writers and any tool: whatever their bytes, a page is read or refused with a reason, gives
// its text, is written as it was and neat, and can be changed. What is written neat settles.

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

std::string Neat(const std::string& page, bool sourceAttributes) {
    HtmlDocument document(page, "file:///C:/Help/html/page.htm");
    tovimar::CHtmlBeautifier beautifier;
    beautifier.UseSourceAttributes = sourceAttributes;
    beautifier.SetDocument(document);
    return beautifier.EditModeReadyHTML();
}

/// Twice around, what the first reading of broken markup moves has found its place: nothing grows on and on.
void Settle(const std::string& page, bool sourceAttributes) {
    const std::string second = Neat(Neat(page, sourceAttributes), sourceAttributes);
    if (Neat(second, sourceAttributes).size() > 2 * second.size() + 1000)
        __builtin_trap();
}

/// Every second element loses its tags, the others get their first child as their last; one is read again.
void Change(HtmlDocument& document, const std::string& part) {
    bool swap = false;
    for (HtmlNode* node : document.all()) {
        swap = !swap;
        if (node->parentNode() == &document.Root())
            continue;
        if (!swap)
            node->removeNode(/*deep=*/false);
        else if (node->firstChild() != nullptr)
            node->appendChild(*node->firstChild());
        node->setAttribute("title", "\"<&");
    }
    document.documentElement()->appendChild(document.createElement("div")).setInnerHTML(part);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    const std::string page(tovimar::fuzz::Text(data, size));
    try {
        HtmlDocument document(page);
        CheckLinks(document.Root());
        document.Root().innerText();
        document.outerHTML();
        Settle(page, /*sourceAttributes=*/false);
        Settle(page, /*sourceAttributes=*/true);
        Change(document, page.substr(0, page.size() / 4));
        CheckLinks(document.Root());
        HtmlDocument again(document.outerHTML());
    } catch (const tovimar::RaisedError& error) {
        if (error.Number() != tovimar::kFailure1)
            __builtin_trap();
    }
    return 0;
}
