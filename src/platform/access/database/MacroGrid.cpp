#include "platform/access/database/MacroGrid.h"

#include "platform/access/database/Bytes.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <utility>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kTexts = 14;
constexpr std::size_t kFirstArgument = 4;
constexpr std::uint16_t kNoText = 0xFFFF;
constexpr std::string_view kXmlMark = "_AXL:";

constexpr auto kActions = std::to_array<std::pair<std::uint16_t, std::string_view>>({
    {1, "AddMenu"},
    {3, "ApplyFilter"},
    {4, "Beep"},
    {5, "CancelEvent"},
    {6, "Close"},
    {7, "CopyObject"},
    {9, "Echo"},
    {11, "FindNext"},
    {12, "FindRecord"},
    {13, "GoToControl"},
    {14, "GoToPage"},
    {15, "GoToRecord"},
    {17, "Hourglass"},
    {19, "Maximize"},
    {20, "Minimize"},
    {21, "MoveSize"},
    {22, "MsgBox"},
    {23, "OpenForm"},
    {24, "OpenQuery"},
    {25, "OpenTable"},
    {26, "PrintOut"},
    {27, "Quit"},
    {28, "Requery"},
    {29, "RepaintObject"},
    {30, "Rename"},
    {31, "Restore"},
    {32, "RunApp"},
    {33, "RunCode"},
    {34, "RunMacro"},
    {35, "RunSQL"},
    {37, "SelectObject"},
    {38, "SendKeys"},
    {40, "SetValue"},
    {41, "SetWarnings"},
    {43, "ShowAllRecords"},
    {44, "StopAllMacros"},
    {45, "StopMacro"},
    {46, "OpenReport"},
    {47, "TransferDatabase"},
    {48, "TransferSpreadsheet"},
    {49, "TransferText"},
    {51, "OutputTo"},
    {52, "DeleteObject"},
    {53, "OpenModule"},
    {54, "SendObject"},
    {55, "ShowToolbar"},
    {56, "Save"},
    {57, "SetMenuItem"},
    {58, "RunCommand"},
    {67, "CloseDatabase"},
    {68, "NavigateTo"},
    {69, "SearchForRecord"},
    {70, "SetProperty"},
    {71, "SingleStep"},
    {72, "ClearMacroError"},
    {73, "OnError"},
    {76, "SetTempVar"},
    {77, "RemoveAllTempVars"},
    {78, "RemoveTempVar"},
    {79, "SetDisplayedCategories"},
    {80, "LockNavigationPane"},
    {81, "RunSavedImportExport"},
    {82, "SetLocalVar"},
    {83, "BrowseTo"},
    {85, "RunDataMacro"},
    {86, "SetOrderBy"},
    {87, "SetFilter"},
    {88, "RefreshRecord"},
    {95, "DeleteRecord"},
});

/// The texts of a row lie behind each other; its offsets tell where each begins.
class RowTexts {
public:
    RowTexts(std::string_view bytes, bool wide) : bytes_(bytes), wide_(wide) {}

    std::string At(std::uint16_t offset) const {
        if (offset == kNoText)
            return {};
        ByteReader reader(bytes_, "The macro");
        reader.Skip(offset);
        if (!wide_)
            return text::AnsiCodePage().Decode(reader.ZeroTerminated());
        const auto start = reader.Position();
        while (reader.U16() != 0) {
        }
        return FromUtf16Bytes(bytes_.substr(start, reader.Position() - start - 2));
    }

private:
    std::string_view bytes_;
    bool wide_;
};

MacroRow ReadRow(ByteReader& reader, bool wide) {
    MacroRow row;
    row.action = reader.U16();
    reader.Skip(2); // its number
    std::array<std::uint16_t, kTexts> offsets{};
    for (auto& offset : offsets)
        offset = reader.U16();
    const auto size = reader.U16();
    const RowTexts texts(reader.Take(size), wide);
    reader.Skip(2);
    row.comment = texts.At(offsets[1]);
    row.condition = texts.At(offsets[2]);
    row.name = texts.At(offsets[3]);
    for (std::size_t i = kFirstArgument; i < kTexts; ++i)
        row.arguments.push_back(texts.At(offsets[i]));
    while (!row.arguments.empty() && row.arguments.back().empty())
        row.arguments.pop_back();
    return row;
}

void AddText(DesignObject& object, const char* name, const std::string& value) {
    if (!value.empty())
        object.properties.emplace_back(name, PropertyValue{PropertyValue::Form::Text, value});
}

std::unique_ptr<DesignObject> RowBlock(const MacroRow& row) {
    auto block = std::make_unique<DesignObject>();
    AddText(*block, "MacroName", row.name);
    AddText(*block, "Condition", row.condition);
    if (row.action != 0)
        AddText(*block, "Action", MacroActionName(row.action));
    AddText(*block, "Comment", row.comment);
    for (const auto& argument : row.arguments)
        block->properties.emplace_back("Argument", PropertyValue{PropertyValue::Form::Text, argument});
    return block;
}

} // namespace

MacroGrid ReadMacroGrid(std::string_view bytes) {
    ByteReader reader(bytes, "The macro");
    MacroGrid grid;
    grid.columnsShown = static_cast<std::int32_t>(reader.U32());
    reader.Skip(28);
    const auto header = reader.U16();
    grid.version = FromUtf16Bytes(reader.Take(header));
    reader.Skip(2);
    while (!reader.AtEnd())
        grid.rows.push_back(ReadRow(reader, !grid.version.empty()));
    return grid;
}

std::string MacroActionName(std::uint16_t action) {
    for (const auto& [number, name] : kActions)
        if (number == action)
            return std::string(name);
    return "Action" + std::to_string(action);
}

std::string MacroXml(const MacroGrid& grid) {
    std::string xml;
    for (const auto& row : grid.rows)
        if (row.comment.starts_with(kXmlMark))
            xml += row.comment.substr(kXmlMark.size());
    return xml;
}

std::string MacroEvent(const MacroGrid& grid) {
    const auto xml = MacroXml(grid);
    const auto head = std::string_view(xml).substr(0, xml.find("<Statements"));
    constexpr std::string_view kAttribute = " Event=\"";
    const auto at = head.find(kAttribute);
    if (at == std::string_view::npos)
        return {};
    const auto start = at + kAttribute.size();
    const auto event = head.substr(start, head.find('"', start) - start);
    const auto isLetter = [](char c) { return (c | 0x20) >= 'a' && (c | 0x20) <= 'z'; };
    return std::all_of(event.begin(), event.end(), isLetter) ? std::string(event) : std::string();
}

std::unique_ptr<DesignObject> MacroBlocks(const MacroGrid& grid) {
    auto root = std::make_unique<DesignObject>();
    const bool current = grid.version == "33";
    root->properties.emplace_back("Version",
                                  PropertyValue{PropertyValue::Form::Number, current ? "196611" : "131074"});
    root->properties.emplace_back(
        "ColumnsShown", PropertyValue{PropertyValue::Form::Number, std::to_string(grid.columnsShown)});
    for (const auto& row : grid.rows) {
        root->children.push_back(RowBlock(row));
        root->children.back()->parent = root.get();
    }
    return root;
}

} // namespace tovimar::platform::access
