#include "platform/access/ExportWriter.h"

#include "platform/access/ExportReader.h"
#include "platform/access/Fixtures.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <fstream>
#include <iterator>

namespace tovimar::platform::access {
namespace {

constexpr const char* kFile = "/app/Orders.form";

/// A head in the order of the host, with everything that a line may be.
const std::string kForm = "Version =20\r\nVersionRequired =20\r\nChecksum =-1872\r\nBegin Form\r\n"
                          "    PopUp = NotDefault\r\n    Width =9000\r\n    ItemSuffix =3\r\n"
                          "    RecSrcDt = Begin\r\n        0x403f3e04\r\n    End\r\n"
                          "    Caption =\"Best\xC3\xA4llningar\"\r\n    OnOpenEmMacro = Begin\r\n"
                          "        Begin\r\n            Action =\"Beep\"\r\n        End\r\n    End\r\n"
                          "    OnClose =\"a very long \"\r\n        \"text\"\r\n    FilterOnLoad =0\r\n"
                          "    Begin\r\n        Begin Section\r\n            HelpContextId =7\r\n"
                          "        End\r\n    End\r\nEnd\r\nCodeBehindForm\r\nBegin Form\r\n";

std::string WithHelp(const std::string& bytes) {
    return WithHelpProperties(bytes, {120, "shop.chm"}, kFile);
}

/// The same with the two lines put in as a person would.
std::string Expected(const std::string& form, const std::string& end = "\r\n") {
    auto text = text::ReplaceAll(form, "    RecSrcDt", "    HelpContextId =120" + end + "    RecSrcDt");
    return text::ReplaceAll(text, "    FilterOnLoad",
                            "    HelpFile =\"shop.chm\"" + end + "    FilterOnLoad");
}

std::string Utf16(const std::string& text, bool little) {
    std::string bytes;
    for (const char16_t unit : text::ToUtf16(text)) {
        const char low = static_cast<char>(unit & 0xff), high = static_cast<char>(unit >> 8);
        bytes += little ? std::string{low, high} : std::string{high, low};
    }
    return bytes;
}

TEST(ExportWriter, OnlyTheTwoLinesAreNewInEveryEncoding) {
    const std::string mark = "\xEF\xBB\xBF", wideMark = "\xEF\xBB\xBF"; // U+FEFF, turned into UTF-16 below
    EXPECT_EQ(WithHelp(kForm), Expected(kForm));
    EXPECT_EQ(WithHelp(mark + kForm), mark + Expected(kForm));
    const auto unixText = text::ReplaceAll(kForm, "\r\n", "\n");
    EXPECT_EQ(WithHelp(unixText), Expected(unixText, "\n"));
    const auto ansi = text::ReplaceAll(kForm, "\xC3\xA4", "\xE4");
    EXPECT_EQ(WithHelp(ansi), Expected(ansi));
    for (const bool little : {true, false})
        for (const auto* start : {"", "\xEF\xBB\xBF"})
            EXPECT_EQ(WithHelp(Utf16(start + kForm, little)), Utf16(start + Expected(kForm), little));
    EXPECT_EQ(WithHelpProperties(Utf16(wideMark + kForm, true), {{}, "Заказы.chm"}, kFile),
              Utf16(wideMark + text::ReplaceAll(kForm, "    FilterOnLoad",
                                                "    HelpFile =\"Заказы.chm\"\r\n    FilterOnLoad"),
                    true));
}

TEST(ExportWriter, WhatIsThereIsReplacedOnItsPlace) {
    EXPECT_EQ(WithHelp(WithHelp(kForm)), WithHelp(kForm));
    const auto other = WithHelpProperties(kForm, {7, "a long name of a help file.chm"}, kFile);
    EXPECT_EQ(WithHelp(other), WithHelp(kForm));
    EXPECT_EQ(WithHelpProperties(kForm, {}, kFile), kForm);
}

TEST(ExportWriter, ShortAndStrangeHeadsAreWritten) {
    EXPECT_EQ(WithHelp("Begin Report\nEnd"),
              "Begin Report\n    HelpContextId =120\n    HelpFile =\"shop.chm\"\nEnd");
    EXPECT_EQ(WithHelp("Begin\n\tBegin Form\n\t\tWidth =1\n\tEnd\nEnd\n"),
              "Begin\n\tBegin Form\n\t\tWidth =1\n\t\tHelpContextId =120\n\t\tHelpFile =\"shop.chm\"\n"
              "\tEnd\nEnd\n");
    EXPECT_EQ(WithHelp("Begin Form\n  RecSrcDt = Begin\n"),
              "Begin Form\n  HelpContextId =120\n  RecSrcDt = Begin\n  HelpFile =\"shop.chm\"\n")
        << "a text that ends too early doesn't end the program";
    EXPECT_EQ(RaisedBy([] { WithHelp("Operation =1\r\n"); }).text,
              "/app/Orders.form: the file holds no form or report.");
}

/// The lines of a real export taken out come back in the same place, and the design stays what it was.
TEST(ExportWriter, RealExportsGetTheirLinesBack) {
    const auto folder = std::filesystem::path(TOVIMAR_SOURCE_DIR "/../shared/corpus/sports-admin");
    if (!std::filesystem::exists(folder))
        GTEST_SKIP() << "The real applications beside the project are absent.";
    int found = 0;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
        const auto kind = entry.path().parent_path().filename();
        if (entry.path().extension() != ".bas" || (kind != "forms" && kind != "reports"))
            continue;
        std::ifstream file(entry.path(), std::ios::binary);
        const std::string bytes{std::istreambuf_iterator<char>(file), {}};
        const auto design = ReadDesign(DecodeExportText(bytes),
                                       kind == "forms" ? ObjectKind::Form : ObjectKind::Report, "x", "x");
        const auto id = design->root->Integer("HelpContextId");
        const auto name = design->root->Text("HelpFile");
        if (id == 0 || name.empty())
            continue;
        ++found;
        const auto idLine = "    HelpContextId =" + std::to_string(id) + "\r\n";
        const auto fileLine = "    HelpFile =\"" + name + "\"\r\n";
        auto bare = bytes;
        for (const auto& line : {idLine, fileLine}) {
            const auto place = bare.find(line);
            ASSERT_NE(place, std::string::npos) << entry.path();
            bare.erase(place, line.size());
        }
        EXPECT_EQ(WithHelpProperties(bare, {id, name}, entry.path().string()), bytes) << entry.path();
    }
    EXPECT_GT(found, 30);
}

} // namespace
} // namespace tovimar::platform::access
