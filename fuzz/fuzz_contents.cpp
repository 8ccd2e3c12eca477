// Contents files come from other tools: any bytes give entries or a reason, and the project text that is made
// of entries loads.

#include "QuietSurroundings.h"
#include "project/CHelpPrjTree.h"
#include "project/clsHHCLoader.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    tovimar::clsHHCLoader loader;
    loader.LoadBytes(std::string(tovimar::fuzz::Text(data, size)));
    if (loader.Root() == nullptr)
        return 0;
    loader.Root()->HHCStr();
    tovimar::CHelpPrjTree tree;
    if (tree.Load({}, false, false, loader.GetXMLStr()) != tovimar::kSuccess || tree.Root() == nullptr)
        __builtin_trap();
    return 0;
}
