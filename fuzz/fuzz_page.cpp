// Pages of a help project come from anywhere. Whatever they hold, in any code page, every word that is read
// is found by looking it up in the index, and in no page but this.

#include "helpcompiler/CodePageText.h"
#include "helpcompiler/PageReader.h"
#include "support/SearchReader.h"

#include <array>
#include <cstddef>
#include <cstdint>

using namespace tovimar::helpcompiler;

namespace {

constexpr std::uint32_t kTopic = 7;
constexpr int kMostLookUps = 40; ///< each decodes a leaf of the tree

void ExpectFound(const PageWords& words, const SearchReader& reader) {
    int lookUps = 0;
    for (std::size_t at = 0; at < words.text.size() && lookUps < kMostLookUps; ++lookUps) {
        const std::string word = words.text.c_str() + at;
        if (word.empty() || reader.Topics(word) != std::set<std::uint32_t>{kTopic})
            __builtin_trap();
        at += word.size() + 1;
    }
}

void ExpectGrowing(const std::vector<PageReference>& references) {
    int line = 1;
    for (const PageReference& reference : references) {
        if (reference.line < line)
            __builtin_trap();
        line = reference.line;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0)
        return 0;
    static const std::array<tovimar::text::CodePage, 4> pages{
        tovimar::text::CodePage(1252), tovimar::text::CodePage(1251), tovimar::text::CodePage(932),
        tovimar::text::CodePage(936)};
    const auto& page = pages[data[0] % pages.size()];
    const std::string bytes =
        InCodePage(std::string_view(reinterpret_cast<const char*>(data) + 1, size - 1), page);
    const PageContent content = ReadPage(bytes, page);
    ExpectGrowing(content.references);
    ReadStyleSheet(bytes);
    SearchIndex index;
    index.Add(kTopic, content.words);
    ExpectFound(content.words, SearchReader(index.Bytes(page.Number(), 0x409)));
    return 0;
}
