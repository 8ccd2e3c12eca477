#include "topics/CFormHTMLManipulator.h"

#include "foundation/BackupFileName.h"
#include "platform/html/HtmlDocument.h"
#include "topics/TopicTest.h"

namespace tovimar {
namespace {

class ManipulatorTest : public test::TopicTest {
protected:
    /// The page after two links were put in.
    std::string Added(const std::string& page) {
        WriteFile("list.htm", page);
        CFormHTMLManipulator manipulator;
        EXPECT_EQ(kSuccess, manipulator.LoadHtmlDocument(Path("list.htm")));
        EXPECT_EQ(kSuccess, manipulator.AddHTMLElementToBody("LI", "<a href=\"A.htm\">A &amp; B</a>"));
        EXPECT_EQ(kSuccess, manipulator.AddHTMLElementToBody("LI", "2"));
        EXPECT_EQ(page, ReadFile(Path("list.htm"))); // nothing before the saving
        EXPECT_EQ(kSuccess, manipulator.SaveDoc());
        manipulator.Terminate();
        EXPECT_EQ(kGeneralFailure, manipulator.SaveDoc());
        return ReadFile(Path("list.htm"));
    }
};

constexpr const char* kLines = "<li><a href=\"A.htm\">A &amp; B</a></li>\r\n<li>2</li>\r\n";

TEST_F(ManipulatorTest, OnlyTheAddedLinesChangeAPage) {
    const std::string lines = kLines;
    const std::string head =
        "<!DOCTYPE html>\r\n<!-- c -->\r\n<HTML >\r\n\r\n<Head></HEAD>\r\n<BODY  bgcolor=#fff>"
        "<p>&copy; caf\xE9<ul><LI>x\r\n";
    const std::string tail = "</BODY>\r\n\r\n</html>\r\n";
    EXPECT_EQ(head + lines + tail, Added(head + tail));
    EXPECT_EQ(head + lines + "\t" + tail, Added(head + "\t" + tail));
    EXPECT_EQ(head + "y\r\n" + lines + tail, Added(head + "y" + tail));
    const std::string script = "\r\n\r\n<script id=\"wbh\">go('</body>')</script>\r\n";
    EXPECT_EQ(head + lines + "</body></HTML>" + script, Added(head + "</body></HTML>" + script));
    EXPECT_EQ("<p>x\r\n" + lines, Added("<p>x"));
    EXPECT_EQ("<html>\r\n" + lines + "</html>", Added("<html>\r\n</html>"));
    EXPECT_EQ("<body>\n<li><a href=\"A.htm\">A &amp; B</a></li>\n<li>2</li>\n</body>",
              Added("<body>\n</body>"));
    EXPECT_EQ("\xEF\xBB\xBF<p>\xC3\xA9\r\n" + lines, Added("\xEF\xBB\xBF<p>\xC3\xA9\r\n"));
}

TEST_F(ManipulatorTest, TheOldFileIsKeptUnderABackupName) {
    const std::string backup = BackupFileName(Path("list.htm"));
    Added("<body>old</body>");
    EXPECT_EQ("<body>old</body>", ReadFile(backup));
    EXPECT_FALSE(environment->files->FileExists(Path("list.htm.tmp")));

    CFormHTMLManipulator manipulator;
    const std::string next = BackupFileName(Path("list.htm"));
    ASSERT_EQ(kSuccess, manipulator.LoadHtmlDocument(Path("list.htm")));
    EXPECT_EQ(kSuccess, manipulator.SaveDoc()); // nothing was added
    EXPECT_FALSE(environment->files->FileExists(next));
}

TEST_F(ManipulatorTest, ADocumentThatWasChangedOtherwiseIsWrittenAsItStands) {
    WriteFile(
        "list.htm",
        "<!DOCTYPE html>\r\n<html><head></head><body><P ID=a>x</P></body></html>\r\n<script>s</script>");
    CFormHTMLManipulator manipulator;
    ASSERT_EQ(kSuccess, manipulator.LoadHtmlDocument(Path("list.htm")));
    manipulator.Document()->getElementById("a")->firstChild()->setNodeValue("y");
    ASSERT_EQ(kSuccess, manipulator.AddHTMLElementToBody("LI", "1"));
    ASSERT_EQ(kSuccess, manipulator.SaveDoc());
    EXPECT_EQ("<!DOCTYPE html>\r\n<html><head></head><body><P "
              "ID=a>y</P><li>1</li></body></html>\r\n<script>s</script>",
              ReadFile(Path("list.htm")));

    HtmlDocument given("<body>given</body>");
    ASSERT_EQ(kSuccess, manipulator.LoadHtmlDocument(Path("given.htm"), &given));
    ASSERT_EQ(kSuccess, manipulator.AddHTMLElementToBody("LI", "1"));
    ASSERT_EQ(kSuccess, manipulator.SaveDoc());
    EXPECT_EQ("<html><head></head><body>given<li>1</li></body></html>", ReadFile(Path("given.htm")));
}

TEST_F(ManipulatorTest, FailuresLeaveTheFileAsItWas) {
    CFormHTMLManipulator manipulator;
    EXPECT_EQ(kGeneralFailure, manipulator.LoadHtmlDocument(""));
    EXPECT_EQ(kGeneralFailure, manipulator.SaveDoc());
    EXPECT_EQ(kGeneralFailure, manipulator.AddHTMLElementToBody("LI", "1"));
    EXPECT_NE(kSuccess, manipulator.LoadHtmlDocument(Path("missing.htm")));
    EXPECT_EQ(nullptr, manipulator.Document());

    const std::string frames = "<html><frameset><frame></frameset></html>";
    WriteFile("list.htm", frames);
    ASSERT_EQ(kSuccess, manipulator.LoadHtmlDocument(Path("list.htm")));
    EXPECT_EQ(kFailure1, manipulator.AddHTMLElementToBody("LI", "1"));
    EXPECT_EQ(kFailure1, manipulator.AddHTMLElementToBody("no name", "1"));
    EXPECT_EQ(frames, ReadFile(Path("list.htm")));
}

} // namespace
} // namespace tovimar
