#include "helpcompiler/Bytes.h"
#include "helpcompiler/InternalFiles.h"

namespace tovimar::helpcompiler {
namespace {

constexpr std::uint32_t kEntrySize = 0xC4;

constexpr std::uint32_t kPaneStyle = 0x2;
constexpr std::uint32_t kStyle = 0x4;
constexpr std::uint32_t kExtendedStyle = 0x8;
constexpr std::uint32_t kRectangle = 0x10;
constexpr std::uint32_t kWidth = 0x20;
constexpr std::uint32_t kShowState = 0x40;
constexpr std::uint32_t kButtons = 0x100;
constexpr std::uint32_t kClosed = 0x200;
constexpr std::uint32_t kTabPosition = 0x400;

struct Field {
    std::size_t offset;
    WindowDefinition::Number WindowDefinition::*number;
    std::uint32_t valid;
};

constexpr Field kFields[] = {{0x10, &WindowDefinition::paneStyle, kPaneStyle},
                             {0x18, &WindowDefinition::style, kStyle},
                             {0x1C, &WindowDefinition::extendedStyle, kExtendedStyle},
                             {0x30, &WindowDefinition::showState, kShowState},
                             {0x4C, &WindowDefinition::navigationWidth, kWidth},
                             {0x70, &WindowDefinition::buttons, kButtons},
                             {0x74, &WindowDefinition::closed, kClosed},
                             {0x78, &WindowDefinition::tab, 0},
                             {0x7C, &WindowDefinition::tabPosition, kTabPosition},
                             {0x80, &WindowDefinition::notify, 0}};

struct TextField {
    std::size_t offset;
    std::string WindowDefinition::*text;
};

constexpr TextField kTexts[] = {{0x08, &WindowDefinition::name},         {0x14, &WindowDefinition::caption},
                                {0x60, &WindowDefinition::contentsFile}, {0x64, &WindowDefinition::indexFile},
                                {0x68, &WindowDefinition::defaultTopic}, {0x6C, &WindowDefinition::home}};

std::string EntryOf(const WindowDefinition& window, StringTable& strings) {
    std::string entry(kEntrySize, '\0');
    SetU32(entry, 0, kEntrySize);
    // The position of the tabs counts as given in every window.
    std::uint32_t valid = kTabPosition;
    for (const Field& field : kFields) {
        const WindowDefinition::Number& number = window.*field.number;
        valid |= number.given ? field.valid : 0;
        SetU32(entry, field.offset, number.value);
    }
    for (const TextField& field : kTexts)
        SetU32(entry, field.offset, strings.Add(window.*field.text));
    if (window.hasRectangle)
        valid |= kRectangle;
    for (std::size_t i = 0; i < 4; ++i)
        SetU32(entry, 0x20 + 4 * i, window.rectangle[i]);
    for (std::size_t i = 0; i < 2; ++i) {
        SetU32(entry, 0x9C + 4 * i, strings.Add(window.jumpTexts[i]));
        SetU32(entry, 0xA4 + 4 * i, strings.Add(window.jumpUrls[i]));
    }
    SetU32(entry, 0x0C, valid);
    return entry;
}

} // namespace

std::string WindowsStream(const std::vector<WindowDefinition>& windows, StringTable& strings) {
    std::string out;
    PutU32(out, static_cast<std::uint32_t>(windows.size()));
    PutU32(out, kEntrySize);
    for (const WindowDefinition& window : windows)
        out += EntryOf(window, strings);
    return out;
}

} // namespace tovimar::helpcompiler
