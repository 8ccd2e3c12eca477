// Contents and index files come from other tools: any bytes give entries within bounds, and of these the
// streams of a compiled help are made, in which the index's tree holds a keyword for each entry with a name.

#include "helpcompiler/CodePageText.h"
#include "helpcompiler/InternalFiles.h"

#include <cstddef>
#include <cstdint>

using namespace tovimar::helpcompiler;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const tovimar::text::CodePage page(1252);
    const std::string bytes = InCodePage({reinterpret_cast<const char*>(data), size}, page);
    HelpDescription help;
    help.binaryIndex = help.fullTextSearch = true;
    help.contents = help.index = ReadSitemap(bytes, page);
    for (const SitemapEntry& entry : help.index.entries)
        if (entry.level < 0 || entry.level > kDeepestSitemapLevel || entry.line < 1)
            __builtin_trap();
    const TopicTables topics(help);
    for (const Topic& topic : topics.Topics())
        if (topics.NumberOf(topic.url) < 0)
            __builtin_trap();
    for (const InternalFile& file : MakeInternalFiles(help, topics, {}))
        if (!file.name.starts_with('/'))
            __builtin_trap();
    return 0;
}
