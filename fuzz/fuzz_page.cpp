// Pages are the writer's, or anybody's: any text becomes a tree or a reason; what is written of the tree
// reads as the same text, and stays the same when it is written again.

#include "QuietSurroundings.h"
#include "editor/CHtmlBeautifier.h"
#include "platform/Error.h"
#include "platform/html/HtmlDocument.h"

#include <string>

namespace {

std::string Neat(const std::string& page, bool sourceAttributes) {
    tovimar::HtmlDocument document(page, "file:///C:/Help/html/page.htm");
    tovimar::CHtmlBeautifier beautifier;
    beautifier.UseSourceAttributes = sourceAttributes;
    beautifier.SetDocument(document);
    return beautifier.EditModeReadyHTML();
}

/// Twice around, everything that only the first reading of broken markup moves has found its place.
void Settle(const std::string& page, bool sourceAttributes) {
    const std::string second = Neat(Neat(page, sourceAttributes), sourceAttributes);
    if (Neat(second, sourceAttributes).size() > 2 * second.size() + 1000)
        __builtin_trap();
}

/// Every second element loses its tags, the others swap their first two children.
void Change(tovimar::HtmlDocument& document) {
    bool swap = false;
    for (tovimar::HtmlNode* node : document.getElementsByTagName("*")) {
        swap = !swap;
        if (node->parentNode() == &document.Root())
            continue;
        if (!swap)
            node->removeNode(/*deep=*/false);
        else if (node->firstChild() != nullptr)
            node->appendChild(*node->firstChild());
        node->setAttribute("title", "\"<&");
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    const std::string page(tovimar::fuzz::Text(data, size));
    try {
        tovimar::HtmlDocument document(page);
        document.body();
        document.Root().innerText();
        const std::string outer = document.outerHTML();
        Settle(page, false);
        Settle(page, true);
        Change(document);
        tovimar::HtmlDocument again(document.outerHTML());
    } catch (const tovimar::RaisedError& error) {
        if (error.Number() != tovimar::kFailure1)
            __builtin_trap();
    }
    return 0;
}
