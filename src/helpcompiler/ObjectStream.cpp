#include "helpcompiler/Bytes.h"
#include "helpcompiler/InternalFiles.h"
#include "helpcompiler/WordTable.h"

/// The stream that tells the viewer how words are split and folded: the table of bytes, the words that aren't
/// stored and, for English, the stemmer.
namespace tovimar::helpcompiler {
namespace {

constexpr std::uint32_t kVersion = 0x4000000;
constexpr std::uint32_t kEnglish = 0x409;
constexpr std::uint32_t kHasStopWords = 4;
constexpr std::uint32_t kHasStemmer = 8;

void PutByteTable(std::string& out) {
    const auto& table = ByteTable();
    for (std::size_t byte = 0; byte < table.size(); ++byte) {
        const ByteTraits& traits = table[byte];
        PutU16(out, static_cast<std::uint32_t>(traits.kind));
        PutU16(out, traits.weight);
        for (const std::size_t value :
             {std::size_t{traits.norm}, byte, std::size_t{traits.mapped}, std::size_t{traits.mapped}})
            out.push_back(static_cast<char>(value));
        PutU16(out, 0);
    }
    for (const char* letters : {"\xC6", "\xE6", "\xDF", "\x8C", "\x9C"})
        out.append(letters).append(LettersOf(static_cast<std::uint8_t>(*letters)));
}

void PutStopWords(std::string& out, const std::vector<std::string>& words) {
    std::string list;
    for (const std::string& word : words) {
        PutU16(list, static_cast<std::uint32_t>(word.size()));
        list += word;
    }
    PutU16(list, 0);
    PutU16(out, 0x2222);
    PutU16(out, 0x28);
    PutU32(out, static_cast<std::uint32_t>(list.size()));
    out.append(32, '\0').append(list);
}

std::string WordBreaker(const HelpDescription& help) {
    const bool english = help.language == kEnglish;
    const auto codePage = static_cast<std::uint32_t>(help.codePage);
    std::string out = FromHex("afda624693d3d0119a5600c04fb68bf7");
    PutU32(out, kVersion);
    PutU32(out, 3U | (help.stopWords.empty() ? 0 : kHasStopWords) | (english ? kHasStemmer : 0));
    PutU32(out, codePage);
    PutU32(out, help.language);
    PutU64(out, 0);
    PutU16(out, 0x5555);
    PutU16(out, 0x14);
    PutU32(out, 0xA0F);
    for (const std::uint32_t number : {256U, 5U, 3U})
        PutU16(out, number);
    out.append(26, '\0');
    PutByteTable(out);
    if (!help.stopWords.empty())
        PutStopWords(out, help.stopWords);
    if (!english)
        return out;
    out += FromHex("a8d5a08fdfded0119a6100c04fb68bf7");
    for (const std::uint32_t number : {kVersion, 1U, codePage, help.language, 0U})
        PutU32(out, number);
    return out;
}

} // namespace

std::string ObjectStream(const HelpDescription& help) {
    const std::string breaker = WordBreaker(help);
    std::string other = FromHex("b0da624693d3d0119a5600c04fb68b66");
    for (const std::uint32_t number :
         {0x29AU, static_cast<std::uint32_t>(help.codePage), help.language, 0x272FU, 0U})
        PutU32(other, number);
    constexpr std::uint32_t kHeadSize = 24;
    const auto size = static_cast<std::uint32_t>(breaker.size());
    std::string out;
    for (const std::uint32_t number :
         {kVersion, 2U, kHeadSize, size, kHeadSize + size, static_cast<std::uint32_t>(other.size())})
        PutU32(out, number);
    return out + breaker + other;
}

} // namespace tovimar::helpcompiler
