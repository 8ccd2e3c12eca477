#include "foundation/BackupFileName.h"
#include "foundation/CUTF8FileReader.h"
#include "foundation/CUTF8FileWriter.h"
#include "foundation/CXMLFile.h"
#include "foundation/Session.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "support/FakeEnvironment.h"

#include <sys/stat.h>

namespace tovimar {
namespace {

constexpr const char* kMark = "<meta content=\"text/html; CHARSET=UTF-8\">";

class TextFilesTest : public test::EnvironmentTest {
protected:
    CUTF8FileReader Read(const std::string& bytes) {
        CUTF8FileReader reader;
        EXPECT_EQ(reader.LoadFile(WriteFile("t.htm", bytes)), 0);
        return reader;
    }
    std::string Written(const std::string& text, bool header, bool plain) {
        EXPECT_EQ(CUTF8FileWriter().SaveFile(Path("w.htm"), text, header, plain), 0);
        return ReadFile(Path("w.htm"));
    }
};

TEST_F(TextFilesTest, ReaderTellsUtf8FromThePage) {
    const auto withHeader = Read("\xEF\xBB\xBF"
                                 "é charset=windows-1251");
    EXPECT_TRUE(withHeader.HasUTF8Header() && withHeader.IsUTF8());
    EXPECT_EQ(withHeader.Text(), "é charset=windows-1251");
    EXPECT_EQ(Read(std::string(kMark) + "é").Text(), std::string(kMark) + "é");
    EXPECT_TRUE(Read("<?xml version=\"1.0\" encoding=\"UTF-8\"?>").IsUTF8());
    const auto farMark = Read(std::string(2048, ' ') + kMark + "\xE9");
    EXPECT_FALSE(farMark.IsUTF8());
    EXPECT_TRUE(farMark.Text().ends_with("é"));
    EXPECT_EQ(Read("\xEF\xBB\xBF\xE9").Text(), "\xEF\xBF\xBD");
    EXPECT_EQ(Read("").Text(), "");
}

TEST_F(TextFilesTest, ReaderReportsWhatItCannotRead) {
    CUTF8FileReader reader;
    EXPECT_EQ(reader.LoadFile(""), kGeneralFailure);
    EXPECT_EQ(Session::Run().runErrorCount, 0);
    EXPECT_EQ(reader.LoadFile(Path("none.htm")), 53);
    EXPECT_EQ(Session::Run().runErrorCount, 1);
}

TEST_F(TextFilesTest, WriterChoosesTheForm) {
    EXPECT_EQ(Written("é", false, false), "é");
    EXPECT_EQ(Written("é", true, false), "\xEF\xBB\xBF"
                                         "é");
    EXPECT_EQ(Written("é", true, true), "\xE9");
    EXPECT_EQ(Written(std::string(kMark) + "é", true, true), "\xEF\xBB\xBF" + std::string(kMark) + "é");
    EXPECT_EQ(Written("Жé", false, true), "?\xE9");
    EXPECT_EQ(Written("<HTML>Жé😀", false, true), "<HTML>&#1046;\xE9&#128512;");
    text::SetAnsiCodePage(1251);
    EXPECT_EQ(Written("<html>Ж", false, true), "<html>\xC6");
}

TEST_F(TextFilesTest, WriterCollects) {
    CUTF8FileWriter writer;
    writer.AddText("a\r\n");
    writer.AddText("b");
    EXPECT_EQ(writer.SaveFile(Path("w.txt")), 0);
    EXPECT_EQ(ReadFile(Path("w.txt")), "a\r\nb");
    EXPECT_EQ(writer.SaveFile(""), kGeneralFailure);
    chmod((NativeFolder() + "/w.txt").c_str(), 0444);
    EXPECT_EQ(writer.SaveFile(Path("w.txt"), "new"), 75);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_NE(boxes->shown[0].text.find("READ_ONLY = True"), std::string::npos);
    EXPECT_EQ(ReadFile(Path("w.txt")), "a\r\nb");
}

TEST_F(TextFilesTest, XmlGetsItsHeader) {
    CXMLFile file;
    EXPECT_EQ(file.SaveXml(Path("a.xml"), "<a>Ж</a>"), 0);
    EXPECT_EQ(ReadFile(Path("a.xml")), "<?xml version=\"1.0\" encoding=\"utf-8\" ?>\r\n<a>Ж</a>");
    EXPECT_EQ(file.SaveXml(Path("a.xml"), ReadFile(Path("a.xml"))), 0);
    XmlDocument document;
    EXPECT_EQ(file.Load(Path("a.xml"), document), 0);
    EXPECT_EQ(document.documentElement().text(), "Ж");
    for (const char* text : {"<a/>", "<?xml version=\"1.0\" encoding=\"koi8-r\"?>\r\n\r\n<a/>  ",
                             "<?xml version=\"1.0\"?><a/>"}) {
        EXPECT_EQ(file.LoadXml(text, document, true), 0) << text;
        EXPECT_EQ(document.documentElement().nodeName(), "a");
    }
    EXPECT_THROW(file.LoadXml("<?xml version=\"1.0\" <a/>", document), RaisedError);
    EXPECT_NE(file.LoadXml("<a>\r\n<b></a>", document), 0);
    EXPECT_EQ(file.XmlParseError.line, "3");
}

TEST_F(TextFilesTest, BackupNamesAreFree) {
    EXPECT_EQ(BackupFileName(Path("a.b.htm")), Path("a.b_20260102.htm"));
    WriteFile("a_20260102.htm", "");
    WriteFile("a_202601021.htm", "");
    EXPECT_EQ(BackupFileName(Path("a.htm")), Path("a_202601022.htm"));
    EXPECT_EQ(BackupFileName(Path("noext")), Path("noext_20260102"));
}

} // namespace
} // namespace tovimar
