#include "platform/access/ExportReader.h"
#include "platform/access/DesignValues.h"
#include "platform/access/Fixtures.h"
#include "platform/text/Text.h"

namespace tovimar::platform::access {
namespace {

std::unique_ptr<Design> ReadForm(std::string_view text) {
    return ReadDesign(text, ObjectKind::Form, "Orders", "/app/Orders.form");
}

const DesignObject* FindNamed(const DesignObject& owner, std::string_view name) {
    for (const auto& child : owner.children) {
        if (child->name == name)
            return child.get();
        if (const auto* found = FindNamed(*child, name))
            return found;
    }
    return nullptr;
}

Raised FailureOf(const std::string& text) {
    return RaisedBy([&] { ReadForm(text); });
}

TEST(ExportReader, ReadsTheTreeOfAForm) {
    const auto design = ReadForm(kOrdersForm);
    EXPECT_EQ(design->root->Text("caption"), "Orders \"new\"");
    EXPECT_EQ(design->root->FindOwn("PrtMip")->text, std::string("\xa2\x05\0\0\xa1\x05\xff", 7));
    ASSERT_EQ(design->Sections().size(), 3U);
    EXPECT_EQ(design->Section(0)->Integer("Height"), 4000);
    EXPECT_EQ(design->Section(1)->name, "FormHeader");
    EXPECT_EQ(design->Section(5), nullptr);
    EXPECT_EQ(design->prototypes.size(), 2U);
    EXPECT_EQ(FindNamed(*design->root, "lblCustomer")->parent->name, "txtCustomer");
    EXPECT_EQ(FindNamed(*design->root, "chkPaid")->parent->parent->type, "Tab");
    EXPECT_EQ(FindNamed(*design->root, "cmd Print")->Text("StatusBarText"), "Prints the order\r\nat once");
    EXPECT_EQ(design->code.substr(0, 12), "Attribute VB");
}

TEST(ExportReader, InheritsFromPrototypesAndBuiltInDefaults) {
    const auto design = ReadForm(kOrdersForm);
    const auto& box = *FindNamed(*design->root, "txtCustomer");
    EXPECT_EQ(box.Integer("Width"), 1701);
    EXPECT_EQ(box.Text("FontName"), "Calibri");
    EXPECT_EQ(box.Integer("FontSize"), 8);
    EXPECT_TRUE(box.Flag("Visible"));
    EXPECT_EQ(box.Integer("NoSuchProperty", 42), 42);
    EXPECT_FALSE(FindNamed(*design->root, "chkPaid")->Flag("Visible"));
    EXPECT_FALSE(design->root->Flag("NavigationButtons"));
    // The label's own mark undoes the prototype's.
    EXPECT_FALSE(FindNamed(*design->root, "lblCustomer")->Flag("FontItalic"));
    EXPECT_TRUE(FindNamed(*design->root, "lblOpen")->Flag("FontItalic"));
    EXPECT_EQ(EffectiveValue(box, "Visible"), Value(true));
    EXPECT_EQ(EffectiveValue(box, "Width"), Value(1701));
    EXPECT_FALSE(EffectiveValue(box, "Caption").has_value());
}

TEST(ExportReader, ReadsEveryEncoding) {
    const std::string caption = "Жук Zürich";
    const auto text = SmallForm("", "    Caption =\"" + caption + "\"\r\n");
    const auto units = text::ToUtf16(text);
    std::string little, big;
    for (const auto unit : units) {
        const char low = static_cast<char>(unit & 0xFF), high = static_cast<char>(unit >> 8);
        little += {low, high};
        big += {high, low};
    }
    for (const auto& bytes :
         {text, "\xEF\xBB\xBF" + text, "\xFF\xFE" + little, "\xFE\xFF" + big, little, big})
        EXPECT_EQ(ReadForm(DecodeExportText(bytes))->root->Text("Caption"), caption);
    text::SetAnsiCodePage(1251);
    EXPECT_EQ(DecodeExportText("\xC6\xF3\xEA"), "Жук");
    text::SetAnsiCodePage(1252);
    EXPECT_EQ(DecodeExportText("Z\xFCrich"), "Zürich");
    EXPECT_EQ(DecodeExportText(""), "");
}

TEST(ExportReader, DecodesQuotedTexts) {
    const auto caption = [](const std::string& value) {
        return ReadForm(SmallForm("", "    Caption =" + value + "\r\n"))->root->Text("Caption");
    };
    EXPECT_EQ(caption(R"("a \"b\" c")"), "a \"b\" c");
    EXPECT_EQ(caption(R"("a ""b"" c")"), "a \"b\" c");
    EXPECT_EQ(caption(R"("C:\\")"), "C:\\");
    EXPECT_EQ(caption(R"("\0111\\015")"), "\t1\\015");
    EXPECT_EQ(caption("\"\""), "");
    EXPECT_EQ(caption("\"a\"\r\n\r\n        \"b\""), "ab");
    EXPECT_EQ(caption("\"a = b\""), "a = b");
}

TEST(ExportReader, KeepsEmbeddedMacrosAsText) {
    const auto design =
        ReadForm(SmallForm("Begin CommandButton\nName =\"cmd\"\nOnClickEmMacro = Begin\nVersion =196611\n"
                           "Begin\nAction =\"Beep\"\nEnd\nEnd\nCaption =\"Go\"\nEnd\n"));
    const auto* button = FindNamed(*design->root, "cmd");
    EXPECT_EQ(button->Text("OnClickEmMacro"), "Version =196611\nBegin\nAction =\"Beep\"\nEnd\n");
    EXPECT_EQ(button->Text("Caption"), "Go");
    EXPECT_TRUE(button->children.empty());
}

TEST(ExportReader, TellsFileAndLineOfAFault) {
    EXPECT_EQ(FailureOf("").text, "/app/Orders.form, line 1: the file holds no block \"Begin Form\".");
    EXPECT_EQ(FailureOf("Begin Form\nEnd\nEnd\n").text,
              "/app/Orders.form, line 3: \"End\" without a block that is open.");
    EXPECT_EQ(FailureOf("Begin Form\n  Begin\n  Begin Label\n").text,
              "/app/Orders.form, line 3: the file ends inside the block that begins in line 3.");
    EXPECT_EQ(FailureOf("Begin Form\n  Caption =\"abc\nEnd\n").text,
              "/app/Orders.form, line 2: a text has no closing quote.");
    EXPECT_EQ(FailureOf("Begin Form\n  X = Begin\n 0x00\n").text,
              "/app/Orders.form, line 3: the file ends inside the data that begin in line 2.");
    EXPECT_EQ(FailureOf(kOrdersForm.substr(0, 900)).number, kFailure1);
    EXPECT_EQ(FailureOf(std::string("\x00\x01\xFF\xFE", 4)).number, kFailure1);
}

TEST(ExportReader, BoundsNestingAndStaysLinear) {
    std::string deep = "Begin Form\n";
    for (int i = 0; i < 10000; ++i)
        deep += "Begin\n";
    EXPECT_EQ(FailureOf(deep).text, "/app/Orders.form, line 201: blocks are nested deeper than 200.");
    std::string wide;
    for (int i = 0; i < 20000; ++i)
        wide += "Begin Label\nName =\"l" + std::to_string(i) + "\"\nEnd\n";
    EXPECT_EQ(ReadForm(SmallForm(wide))->Section(0)->children.size(), 20000U);
    std::string pieces = "    Caption =\"x\"\n";
    for (int i = 0; i < 50000; ++i)
        pieces += "\"yyyyyyyyyy\"\n";
    EXPECT_EQ(ReadForm(SmallForm("", pieces))->root->Text("Caption").size(), 500001U);
}

TEST(ExportReader, ReadsMacrosAsRowsOfActions) {
    const auto macro =
        ReadDesign("Version =196611\nColumnsShown =0\nBegin\nAction =\"OpenForm\"\nArgument =\"a\"\n"
                   "Argument =\"0\"\nEnd\nBegin\nComment =\"_AXL:<x/>\"\nEnd\n",
                   ObjectKind::Macro, "AutoExec", "/app/AutoExec.bas");
    ASSERT_EQ(macro->root->children.size(), 2U);
    EXPECT_EQ(macro->root->type, "Macro");
    EXPECT_EQ(macro->root->children[0]->type, "Action");
    EXPECT_EQ(macro->root->children[0]->properties.size(), 3U);
}

TEST(ExportReader, NumbersGroupSections) {
    const auto report = ReadDesign(
        "Begin Report\nBegin\nBegin BreakLevel\nEnd\nBegin BreakHeader\nName =\"G0\"\nEnd\n"
        "Begin BreakFooter\nBreakLevel =1\nName =\"F1\"\nEnd\nBegin Section\nName =\"D\"\nEnd\nEnd\nEnd\n",
        ObjectKind::Report, "r", "/app/r.report");
    EXPECT_EQ(report->Section(5)->name, "G0");
    EXPECT_EQ(report->Section(8)->name, "F1");
    EXPECT_EQ(report->Sections().front().number, 0);
}

TEST(ExportContents, AreRecognisedByTheirFirstLines) {
    EXPECT_EQ(RecognizeExport(kOrdersForm), ExportContent::Form);
    EXPECT_EQ(RecognizeExport("Version =21\r\n\r\nBegin Report\r\n"), ExportContent::Report);
    EXPECT_EQ(RecognizeExport("Version =0\nColumnsShown =0\nBegin\n"), ExportContent::Macro);
    EXPECT_EQ(RecognizeExport("Operation =1\nOption =0\n"), ExportContent::Query);
    EXPECT_EQ(RecognizeExport("dbMemo \"SQL\" =\"SELECT 1\"\n"), ExportContent::Query);
    EXPECT_EQ(RecognizeExport("Attribute VB_Name = \"m\"\n"), ExportContent::Module);
    EXPECT_EQ(RecognizeExport("CREATE TABLE [t] (\n"), ExportContent::TableSql);
    EXPECT_EQ(RecognizeExport("\nSELECT\n a\n"), ExportContent::QuerySql);
    EXPECT_EQ(RecognizeExport("{\n"), ExportContent::Json);
    EXPECT_EQ(RecognizeExport("<?xml version=\"1.0\"?>"), ExportContent::Xml);
    EXPECT_EQ(RecognizeExport("Dear reader,\n"), ExportContent::Unknown);
}

TEST(ModuleSource, IsShownWithoutItsHiddenLines) {
    EXPECT_EQ(
        VisibleCode(
            "VERSION 1.0 CLASS\r\nBEGIN\r\n  MultiUse = -1\r\nEND\r\nAttribute VB_Name = \"c\"\r\nDim a\r\n"),
        "Dim a\r\n");
    EXPECT_EQ(VisibleCode("Attribute\nDim b"), "Attribute\nDim b");
}

} // namespace
} // namespace tovimar::platform::access
