// A project file is a user's file: whatever it holds, it loads or is refused with a report. What was saved
// loads again with every node, and after some rounds, in which captions lose entities that stood in them as
// text, the text stays the same.

#include "QuietSurroundings.h"
#include "project/CHelpPrjTree.h"

namespace {

/// Loads the text and puts what is saved of it in its place; -1 when it doesn't load, else the nodes.
int Saves(std::string& text) {
    tovimar::CHelpPrjTree tree;
    if (tree.Load({}, false, false, text) != tovimar::kSuccess || tree.Root() == nullptr)
        return -1;
    text = tree.GetXMLStr(/*vfSkipSerializers=*/false);
    tree.GetHHCStr(false);
    return tree.NodesQty();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    std::string text(tovimar::fuzz::Text(data, size));
    const int nodes = text.empty() ? -1 : Saves(text);
    if (nodes < 0)
        return 0;
    constexpr int kMostRounds = 50;
    for (int round = 0; round < kMostRounds; ++round) {
        const std::string before = text;
        if (Saves(text) != nodes)
            __builtin_trap();
        if (text == before)
            return 0;
        // Each round takes an "amp" out of the text.
        if (text.size() >= before.size() && round > 1)
            __builtin_trap();
    }
    return 0;
}
