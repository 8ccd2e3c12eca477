// Definitions are files of a project that others write too: whatever stands in one, it loads or is refused,
// and what was saved once stays the same however often it is loaded and saved.

#include "QuietSurroundings.h"
#include "uimodel/CXmlForm.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    tovimar::CXmlForm form;
    if (form.LoadXml(std::string(tovimar::fuzz::Text(data, size))) != tovimar::kSuccess)
        return 0;
    const std::string saved = form.XMLSTr();
    tovimar::CXmlForm again;
    if (again.LoadXml(saved) != tovimar::kSuccess || again.XMLSTr() != saved)
        __builtin_trap();
    return 0;
}
