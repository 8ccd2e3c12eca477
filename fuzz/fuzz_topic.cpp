// Topics come back from any editor: all three readers take any text, what they find is written and read as it
// was, and a page keeps every byte beside the line that is put into it.

#include "MemoryFiles.h"
#include "QuietSurroundings.h"
#include "platform/text/Text.h"
#include "topics/CFormHTMLControlDefs.h"
#include "topics/CFormHTMLManipulator.h"

#include <string>

namespace {

using tovimar::CFormHTMLControlDef;

void ReadBack(const CFormHTMLControlDef& def) {
    CFormHTMLControlDef again;
    // Control characters aren't XML's.
    if (!def.IsValid() || again.ParseXML(def.XMLSTr()) != tovimar::kSuccess)
        return;
    if (again.IsMenu != def.IsMenu)
        __builtin_trap();
}

void Add(const std::string& page) {
    const std::string path = "C:\\list.htm";
    tovimar::fuzz::MemoryFiles& files = tovimar::fuzz::FilesWith(path, page);
    tovimar::CFormHTMLManipulator manipulator;
    if (manipulator.LoadHtmlDocument(path) != tovimar::kSuccess ||
        manipulator.AddHTMLElementToBody("LI", "<a href=\"x\">x</a>") != tovimar::kSuccess ||
        manipulator.SaveDoc() != tovimar::kSuccess)
        return;
    const std::string saved = files.ReadFile(path);
    // Bytes that are no text become its replacement; all others stay.
    if (page.size() > 0 && saved.size() < page.size() + 20)
        __builtin_trap();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    const std::string page(tovimar::fuzz::Text(data, size));
    const std::string text = tovimar::text::MakeValidUtf8(page);
    tovimar::CFormHTMLControlDefs defs;
    defs.ParseText(text);
    defs.Parse1(text, "", "x|y");
    defs.Parse2(text, "Orders", "");
    for (const auto& def : defs.Controls)
        ReadBack(*def);
    for (const auto& def : defs.Menus)
        ReadBack(*def);
    Add(page);
    return 0;
}
