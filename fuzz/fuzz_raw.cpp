// The raw description of an object comes from the host's side and carries whatever the application holds: its
// adjustment ends with a definition that loads, or with nothing. The first byte chooses view, picture type
// and how positions are meant.

#include "QuietSurroundings.h"
#include "uimodel/CClientUIObjectXml.h"
#include "uimodel/CXmlForm.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0)
        return 0;
    tovimar::fuzz::Prepare();
    const unsigned choice = data[0];
    const std::string adjusted = tovimar::CClientUIObjectXml().Adjust(
        std::string(tovimar::fuzz::Text(data + 1, size - 1)), 2, (choice & 1U) != 0,
        (choice & 2U) != 0 ? 2 : 1, "Z:\\help\\images\\Fuzzed.jpg", "Z:\\help\\Fuzzed.htm", "images\\",
        (choice & 4U) != 0);
    if (adjusted.empty())
        return 0;
    tovimar::CXmlForm form;
    if (form.LoadXml(adjusted) != tovimar::kSuccess)
        __builtin_trap();
    for (const auto* control : form.AllControls()) {
        control->HotSpotLeft();
        control->HotSpotTop();
        control->HotSpotRight();
        control->HotSpotBottom();
    }
    return 0;
}
