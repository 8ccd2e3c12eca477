// Definitions are files of a project that others write too: whatever stands in one, it loads or is refused.
// What was saved loads again, and from the second saving on the text stays the same however often that is
// done; the first one may still lose what the format has no place for, such as a tab index below 0.

#include "QuietSurroundings.h"
#include "uimodel/CXmlForm.h"

namespace {

/// Loads the text and puts what is saved of it in its place; false when it doesn't load.
bool Saves(std::string& text) {
    tovimar::CXmlForm form;
    if (form.LoadXml(text) != tovimar::kSuccess)
        return false;
    text = form.XMLSTr();
    return true;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    std::string text(tovimar::fuzz::Text(data, size));
    if (!Saves(text))
        return 0;
    if (!Saves(text))
        __builtin_trap();
    const std::string settled = text;
    if (!Saves(text) || text != settled)
        __builtin_trap();
    return 0;
}
