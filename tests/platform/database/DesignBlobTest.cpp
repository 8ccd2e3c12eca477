#include "platform/access/database/DesignBlob.h"
#include "platform/access/ExportReader.h"
#include "platform/access/ExportTreeText.h"
#include "platform/access/Fixtures.h"
#include "platform/access/database/BlobTree.h"
#include "platform/access/database/PropertyCodes.h"
#include "platform/database/ByteText.h"

#include <gmock/gmock.h>

namespace tovimar::platform::access {
namespace {

using ::testing::HasSubstr;

std::string TextOf(const std::string& blob) {
    return text::ReplaceAll(ExportTreeText(*BlobBlocks(ReadDesignBlob(blob)).get()), "\r\n", "\n");
}

std::string MacroBytes() {
    const std::string texts = Wide("Orders") + Le16(0);
    std::string offsets;
    for (int i = 0; i < 14; ++i)
        offsets += Le16(i == 4 ? 0 : 0xFFFF);
    return Le32(0) + std::string(28, '\0') + Le16(4) + Wide("33") + Le16(0) + Le16(23) + Le16(0) + offsets +
           Le16(texts.size()) + texts + Le16(0);
}

/// A prototype, a section, a text box with its label, and every kind of value.
BlobText Orders(int shift = 0) {
    BlobText form(150);
    form.Flag(6, 19).Short(99, 150, 9000).Record(221, 17, 12, Wide("Orders \"new\"\r\n\\ Żółw"));
    form.Record(300, 684 + shift, 4, Le32(7));
    form.List(2, 100).Flag(1, 33).Record(260, 622 + shift, 4, Le32(0xFFFFFFFF));
    form.Next(152).Text(223, 20, "Detail").Short(96, 44, 4000);
    form.List(2, 109).Text(220, 20, "txtCustomer").Short(96, 54, -20).Record(156, 28, 4, Le32(0x8000000F));
    form.Record(310, 624 + shift, 6, std::string("\0\0\xBE\x42", 4));
    form.Record(48, 71, 2, std::string(1, '\xFF')).Record(300, 692 + shift, 1, std::string(1, '\xFF'));
    form.Record(234, 376, 9, "0123456789abcdef").Record(270, 462 + shift, 4, Le32(1));
    form.Only(100).Text(220, 20, "lblCustomer").Record(221, 17, 12, Wide("Customer:"));
    form.Next(104).Text(220, 20, "cmdOpen").Record(340, 490 + shift, 17, MacroBytes());
    return form;
}

constexpr const char* kOrdersText = R"(Version =20
VersionRequired =20
Begin Form
    RecordSelectors = NotDefault
    Width =9000
    Caption ="Orders \"new\"\015\012\\ Żółw"
    Unknown684 =7
    Begin
        Begin Label
            FontItalic = NotDefault
            ForeThemeColorIndex =-1
        End
        Begin Section
            Name ="Detail"
            Height =4000
            Begin
                Begin TextBox
                    Name ="txtCustomer"
                    Left =-20
                    BackColor =-2147483633
                    ForeShade =95.0
                    DecimalPlaces =255
                    Gradient =255
                    GUID = Begin
                        0x30313233343536373839616263646566
                    End
                    GridlineColor =1
                    Begin
                        Begin Label
                            Name ="lblCustomer"
                            Caption ="Customer:"
                        End
                    End
                End
                Begin CommandButton
                    Name ="cmdOpen"
                    OnClick ="[Embedded Macro]"
                    OnClickEmMacro = Begin
                            Version =196611
                            ColumnsShown =0
                            Begin
                                Action ="OpenForm"
                                Argument ="Orders"
                            End
                    End
                End
            End
        End
    End
End
)";

TEST(DesignBlob, BecomesTheBlocksOfATextExport) {
    const auto blob = Orders().End();
    EXPECT_EQ(TextOf(blob), kOrdersText);
    const auto design = ReadDesignBlob(blob);
    EXPECT_TRUE(design.closed);
    EXPECT_EQ(design.unread, 0U);
}

TEST(DesignBlob, NewerNumbersAreTheSameProperties) {
    EXPECT_EQ(TextOf(Orders(/*shift=*/1).End()), kOrdersText);
}

TEST(DesignBlob, TheHelpFileIsKnownByItsName) {
    EXPECT_THAT(TextOf(BlobText(150).Text(229, 218, "Shop.CHM").Record(156, 219, 4, Le32(4711)).End()),
                HasSubstr("    HelpFile =\"Shop.CHM\"\n    HelpContextId =4711\n"));
}

TEST(DesignBlob, AnswersAsItsTextDoes) {
    const auto blob = Orders().End();
    const auto read =
        DesignOfTree({BlobBlocks(ReadDesignBlob(blob)), {}}, ObjectKind::Form, "Orders", "/x.accdb");
    const auto again =
        ReadDesign(ExportTreeText(*BlobBlocks(ReadDesignBlob(blob))), ObjectKind::Form, "Orders", "/x.form");
    for (const auto* design : {read.get(), again.get()}) {
        EXPECT_EQ(design->root->Integer("Width"), 9000);
        EXPECT_FALSE(design->root->Flag("RecordSelectors"));
        EXPECT_EQ(design->root->Text("Caption"), "Orders \"new\"\r\n\\ Żółw");
        const auto& box = *design->Section(0)->children.at(0);
        EXPECT_EQ(box.Integer("Left"), -20);
        EXPECT_TRUE(box.children.at(0)->Flag("FontItalic"));
        EXPECT_THAT(design->Section(0)->children.at(1)->Text("OnClickEmMacro"),
                    HasSubstr("Argument =\"Orders\""));
    }
}

/// The year 2000: no codes, one byte for a slot, later properties in a tree of their own.
TEST(DesignBlob, CompactEncodingMeansTheSame) {
    const auto wide = [](const char* value) {
        return std::string(1, static_cast<char>(Wide(value).size())) + Wide(value);
    };
    const std::string compact = Le16(0x13) + Le16(0x13) + Le32(0) + Le16(150) + "\x06" + "\x63" + Le16(9000) +
                                "\xDD" + wide("Orders") + "\xFF" + Le16(1) + Le16(152) + "\xDF" +
                                wide("Detail") + "\xFE" + Le16(109) + "\xDC" + wide("txtCustomer") + "\x60" +
                                Le16(120) + std::string("\x02\xFD", 2);
    const auto blob = ReadDesignBlob(compact);
    EXPECT_TRUE(blob.closed);
    EXPECT_EQ(text::ReplaceAll(ExportTreeText(*BlobBlocks(blob)), "\r\n", "\n"), R"(Version =19
VersionRequired =20
Begin Form
    RecordSelectors = NotDefault
    Width =9000
    Caption ="Orders"
    Begin
        Begin Section
            Name ="Detail"
            Begin
                Begin TextBox
                    Name ="txtCustomer"
                    Left =120
                    Locked = NotDefault
                End
            End
        End
    End
End
)");
    BlobText later(150);
    later.Record(300, 652, 4, Le32(5)).Short(99, 150, 1).List(1, 152).Only(109).Record(400, 692, 4, Le32(12));
    auto merged = ReadDesignBlob(compact);
    const auto delta = later.End();
    MergeDelta(merged, delta);
    const auto shown = ExportTreeText(*BlobBlocks(merged));
    EXPECT_THAT(shown, HasSubstr("HoverColor =5"));
    EXPECT_THAT(shown, HasSubstr("Gradient =12"));
    EXPECT_THAT(shown, HasSubstr("Width =9000"));
}

TEST(DesignBlob, DamageIsToldAndBounded) {
    const auto reason = [](const std::string& blob) { return RaisedBy([&] { ReadDesignBlob(blob); }).text; };
    const auto sound = Orders().End();
    EXPECT_EQ(reason(""), "The design ends too early.");
    EXPECT_EQ(reason(sound.substr(0, 60)), "The design ends too early.");
    EXPECT_EQ(reason(Le16(0x99) + sound.substr(2)),
              "The design is of an encoding that isn't known, number 153.");
    EXPECT_EQ(reason(BlobText(150).Record(221, 17, 12, "x").bytes.replace(22, 4, Le32(0xFFFFFFFF))),
              "The design ends too early.");
    BlobText deep(150);
    for (int i = 0; i < 300; ++i)
        deep.Only(109);
    EXPECT_EQ(reason(deep.End()), "The design is nested deeper than 200.");
    EXPECT_EQ(reason(BlobText(150).Next(100).Next(100).bytes), "");
    const auto unfinished = BlobText(150).List(3, 100).End();
    EXPECT_FALSE(ReadDesignBlob(unfinished).closed);
    const auto longer = sound + "rest";
    EXPECT_EQ(ReadDesignBlob(longer).unread, 4U);
}

TEST(PropertyCodes, NamesAndNumbersBelongTogether) {
    EXPECT_EQ(ObjectTypeNumber(ObjectTypeName(111)), 111);
    EXPECT_EQ(ObjectTypeName(999), "Object999");
    EXPECT_EQ(PropertyName(736), "Overlaps");
    EXPECT_EQ(PropertyName(737), "Unknown737");
    EXPECT_EQ(CodeOfSlot(111, 223), 91);
    EXPECT_EQ(CodeOfSlot(111, 250), 38);
    EXPECT_EQ(CodeOfSlot(100, 96), 54);
    EXPECT_EQ(CodeOfSlot(110, 96), 70);
    EXPECT_EQ(CodeOfSlot(100, 250), kUnknownCode);
}

} // namespace
} // namespace tovimar::platform::access
