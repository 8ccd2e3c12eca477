#include "helpcompiler/Bytes.h"
#include "helpcompiler/InternalFiles.h"
#include "platform/text/Caseless.h"

#include <algorithm>
#include <charconv>

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kIndexHeaderSize = 4096;
constexpr std::size_t kLongestText = 0xFFFE; ///< a record's length has two bytes

enum class Record : std::uint32_t {
    ContentsFile = 0,
    IndexFile = 1,
    DefaultTopic = 2,
    Title = 3,
    Settings = 4,
    DefaultWindow = 5,
    CompiledFile = 6,
    IndexHash = 7,
    Compiler = 9,
    Time = 10,
    InformationTypes = 12,
    IndexHeader = 13,
    InformationChecksum = 15,
    DefaultFont = 16
};

/// Counts tenths of a microsecond from 1601.
std::uint64_t FileTimeOf(std::uint32_t seconds) {
    constexpr std::uint64_t kFrom1601To1970 = 11644473600ULL;
    return (seconds + kFrom1601To1970) * 10000000ULL;
}

std::string Number(std::uint32_t number) {
    std::string out;
    PutU32(out, number);
    return out;
}

/// The name without folders and extension, in lower case.
std::string StemOf(const std::string& file) {
    const std::size_t start = file.find_last_of("/\\") + 1;
    std::string stem = file.substr(start, file.find_last_of('.') - start);
    std::transform(stem.begin(), stem.end(), stem.begin(), text::CaselessAscii);
    return stem;
}

class SystemWriter {
public:
    SystemWriter(const HelpDescription& help, bool binaryIndex) : help_(help), binaryIndex_(binaryIndex) {
        for (const WindowDefinition& window : help.windows)
            if (text::CaselessEqual()(window.name, help.defaultWindow))
                window_ = &window;
    }

    std::string Write(const std::string& indexHeader) {
        PutU32(out_, 3);
        Put(Record::Time, Number(help_.time));
        PutText(Record::Compiler, "HHA Version 4.74.8702");
        Put(Record::Settings, Settings());
        PutGiven(Record::DefaultTopic, help_.defaultTopic);
        PutGiven(Record::Title, help_.title);
        PutGiven(Record::DefaultFont, help_.defaultFont);
        PutGiven(Record::CompiledFile, StemOf(help_.compiledFile));
        PutGiven(Record::DefaultWindow, help_.defaultWindow);
        // A default window with lists of its own names them itself.
        if (window_ == nullptr || window_->contentsFile.empty())
            PutGiven(Record::ContentsFile, help_.contentsFile);
        if (window_ == nullptr || window_->indexFile.empty())
            PutGiven(Record::IndexFile, help_.indexFile);
        if (binaryIndex_)
            Put(Record::IndexHash, Number(HashOfUrl(help_.indexFile)));
        Put(Record::InformationTypes, Number(0));
        // Some viewers look no further than the first 4 KB, so this large record comes behind the texts.
        Put(Record::IndexHeader, indexHeader);
        Put(Record::InformationChecksum, Number(0));
        return std::move(out_);
    }

private:
    void Put(Record record, const std::string& data) {
        PutU16(out_, static_cast<std::uint32_t>(record));
        PutU16(out_, static_cast<std::uint32_t>(data.size()));
        out_ += data;
    }

    void PutText(Record record, std::string text) {
        text.resize(std::min(text.size(), kLongestText));
        text.push_back('\0');
        Put(record, text);
    }

    void PutGiven(Record record, const std::string& text) {
        if (!text.empty())
            PutText(record, text);
    }

    std::string Settings() const {
        std::string data = Number(help_.language);
        PutU32(data, 0);
        PutU32(data, help_.fullTextSearch ? 1 : 0);
        PutU32(data, binaryIndex_ ? 1 : 0);
        PutU32(data, 0);
        PutU64(data, FileTimeOf(help_.time));
        PutU64(data, 0);
        return data;
    }

    const HelpDescription& help_;
    bool binaryIndex_;
    const WindowDefinition* window_ = nullptr;
    std::string out_;
};

/// "0x800025" or "33"; all bits set for a text that is no number, which stands for none.
std::uint32_t NumberOf(std::string_view text) {
    const bool hexadecimal = text.starts_with("0x") || text.starts_with("0X");
    text.remove_prefix(hexadecimal ? 2 : 0);
    std::uint32_t number = 0;
    const auto result =
        std::from_chars(text.data(), text.data() + text.size(), number, hexadecimal ? 16 : 10);
    return result.ec == std::errc() ? number : 0xFFFFFFFFU;
}

} // namespace

std::string SystemStream(const HelpDescription& help, const std::string& indexHeader, bool binaryIndex) {
    return SystemWriter(help, binaryIndex).Write(indexHeader);
}

std::string IndexHeaderStream(const HelpDescription& help, std::size_t topics, StringTable& strings) {
    const SitemapEntry& properties = help.contents.properties;
    const auto text = [&](std::string_view name) {
        const std::string value = properties.Value(name);
        return value.empty() ? 0xFFFFFFFFU : strings.Add(value);
    };
    std::string out = "T#SM";
    for (const std::uint32_t number : {help.time, 1U, static_cast<std::uint32_t>(topics), 0U, 0xFFFFFFFFU, 0U,
                                       help.contents.UsesFolderIcons() ? 1U : 0U})
        PutU32(out, number);
    PutU32(out, NumberOf(properties.Value("Background")));
    PutU32(out, NumberOf(properties.Value("Foreground")));
    PutU32(out, text("Font"));
    PutU32(out, NumberOf(properties.Value("Window Styles")));
    PutU32(out, NumberOf(properties.Value("ExWindow Styles")));
    PutU32(out, 0xFFFFFFFFU);
    PutU32(out, text("FrameName"));
    PutU32(out, text("WindowName"));
    PutU32(out, 0);
    PutU32(out, 1);
    constexpr std::size_t kMostMerged = (kIndexHeaderSize - 0x50) / 4;
    const std::size_t merged = std::min(help.mergedFiles.size(), kMostMerged);
    PutU32(out, static_cast<std::uint32_t>(merged));
    PutU32(out, 0);
    for (std::size_t i = 0; i < merged; ++i)
        PutU32(out, strings.Add(help.mergedFiles[i]));
    out.resize(kIndexHeaderSize, '\0');
    return out;
}

} // namespace tovimar::helpcompiler
