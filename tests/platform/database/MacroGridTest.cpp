#include "platform/access/database/MacroGrid.h"
#include "platform/access/ExportTreeText.h"
#include "platform/access/Fixtures.h"
#include "platform/database/ByteText.h"

#include <array>

namespace tovimar::platform::access {
namespace {

/// A row with its texts by their places: 1 comment, 2 condition, 3 name, 4 and up the arguments.
std::string Row(int action, const std::array<const char*, 7>& values, bool wide = true) {
    std::string offsets;
    std::string texts;
    for (std::size_t i = 0; i < 14; ++i) {
        if (i >= values.size() || values[i] == nullptr) {
            offsets += Le16(0xFFFF);
            continue;
        }
        offsets += Le16(texts.size());
        texts += wide ? Wide(values[i]) + Le16(0) : std::string(values[i]) + '\0';
    }
    return Le16(static_cast<std::uint64_t>(action)) + Le16(0) + offsets + Le16(texts.size()) + texts +
           Le16(0);
}

std::string Grid(const std::string& version, const std::string& rows) {
    return Le32(2) + std::string(28, '\xFF') + Le16(Wide(version).size()) + Wide(version) + Le16(0) + rows;
}

TEST(MacroGrid, BecomesTheRowsOfATextExport) {
    const auto grid = ReadMacroGrid(
        Grid("33", Row(23, {nullptr, "Opens Größen", "[A]>1", "Start", "Orders", "", "3"}) +
                       Row(0, {nullptr, "_AXL:<UserInterfaceMacro For=\"x\" Event=\"OnClick\"><Sta"}) +
                       Row(0, {nullptr, "_AXL:tements/></UserInterfaceMacro>"}) + Row(99, {})));
    EXPECT_EQ(MacroEvent(grid), "OnClick");
    EXPECT_EQ(MacroXml(grid),
              "<UserInterfaceMacro For=\"x\" Event=\"OnClick\"><Statements/></UserInterfaceMacro>");
    EXPECT_EQ(text::ReplaceAll(ExportTreeText(*MacroBlocks(grid)), "\r\n", "\n"), R"(Version =196611
ColumnsShown =2
Begin
    MacroName ="Start"
    Condition ="[A]>1"
    Action ="OpenForm"
    Comment ="Opens Größen"
    Argument ="Orders"
    Argument =""
    Argument ="3"
End
Begin
    Comment ="_AXL:<UserInterfaceMacro For=\"x\" Event=\"OnClick\"><Sta"
End
Begin
    Comment ="_AXL:tements/></UserInterfaceMacro>"
End
Begin
    Action ="Action99"
End
)");
}

TEST(MacroGrid, OldOnesAreOfSingleBytes) {
    const auto grid = ReadMacroGrid(Grid("", Row(22,
                                                 {nullptr, nullptr, nullptr, nullptr,
                                                  "Gr\xFC\xDF"
                                                  "e"},
                                                 false)));
    EXPECT_EQ(grid.rows.at(0).arguments, std::vector<std::string>{"Grüße"});
}

TEST(MacroGrid, TextsOutsideOfTheirRowAreTold) {
    EXPECT_EQ(RaisedBy([] { ReadMacroGrid("x"); }).text, "The macro ends too early.");
    auto row = Row(23, {nullptr, "abc"});
    row.replace(6, 2, Le16(7000));
    EXPECT_EQ(RaisedBy([&] { ReadMacroGrid(Grid("33", row)); }).text, "The macro ends too early.");
    auto open = Row(23, {nullptr, "abc"});
    open.replace(open.size() - 4, 2, "zz");
    EXPECT_EQ(RaisedBy([&] { ReadMacroGrid(Grid("33", open)); }).text, "The macro ends too early.");
}

} // namespace
} // namespace tovimar::platform::access
