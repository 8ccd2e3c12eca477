#include "topics/clsHTMLFile.h"

#include "platform/Environment.h"
#include "topics/TopicTest.h"

#include <filesystem>

namespace tovimar {
namespace {

class HtmlFileTest : public test::TopicTest {
protected:
    HtmlFileTest() {
        messages.Load(WriteFile("Messages.xml",
                                "<Messages><M Code='{{HelpScreenshots}}' Text='No pictures.'/>"
                                "<M Code='{{DatamodelScreenshot}}' Text='No model.'/></Messages>"));
        Session::SetMessages(&messages);
        parameters.Charset = "windows-1251";
        parameters.ApplicationNameStr = "Shop";
    }
    std::string Saved(const std::string& page) {
        clsHTMLFile file;
        EXPECT_EQ(kSuccess, file.Load(WriteFile("p.htm", page)));
        EXPECT_EQ(kSuccess, file.Save());
        return ReadFile(Path("p.htm"));
    }
    CXmlMessages messages;
};

TEST_F(HtmlFileTest, FillsInTheAttributesOfAPage) {
    WriteFile(
        "p.htm",
        "<TITLE>{{Application}}</TITLE>{{CHARSET}}{{StyleSheetLinkHtml}}<H1>old</H1><h1>second</h1>{{body}}");
    clsHTMLFile file;
    ASSERT_EQ(kSuccess, file.Load(Path("p.htm")));
    EXPECT_EQ("Shop", file.Title);
    EXPECT_EQ("old", file.Caption);
    file.Title = "T {Application}";
    file.Caption = "C";
    file.ZoomFactor = "0.8";
    file.CSSFullPath = "C:\\h\\a.css";
    file.Body = "<p>b</p>";
    ASSERT_EQ(kSuccess, file.Save(Path("q.htm")));
    EXPECT_EQ(
        "<TITLE>T Shop</TITLE>windows-1251<link href=\"a.css\" type=\"text/css\" rel=\"stylesheet\" >\r\n"
        "<style type=\"text/css\" media=\"screen\">\r\nbody {zoom: "
        "0.8}\r\n</style>\r\n<H1>C</H1><h1>second</h1><p>b</p>",
        ReadFile(Path("q.htm")));
    file.Charset = "utf-8";
    EXPECT_EQ("plain", Saved("plain"));
    EXPECT_EQ("a", Saved("a{{StyleSheetLinkHtml}}"));
}

TEST_F(HtmlFileTest, PagesWithoutTheirPictureSaySo) {
    EXPECT_EQ("<h1>x</h1>\rNo pictures.</body>", Saved("<h1>x</h1>\r\n<p>{{MAP}}</p></body>"));
    EXPECT_EQ("<h1>x</h1>{{MAP}}", Saved("<h1>x</h1>{{MAP}}"));
    EXPECT_EQ("{{MAP}}<h1>x</h1>No pictures.</body>", Saved("{{MAP}}<h1>x</h1></body>"));
    EXPECT_EQ("[<p>No model.</p>]", Saved("[{{DatamodelImage}}{{Relationships}}]"));
}

TEST_F(HtmlFileTest, CodesOfPathsAndFiles) {
    clsHTMLFile file;
    EXPECT_EQ(kFailure1, file.Load(""));
    EXPECT_EQ(kFailure2, file.Load(Path("none.htm")));
    EXPECT_EQ(kFailure1, clsHTMLFile().Save());
}

TEST_F(HtmlFileTest, TheOldFileComesBackWhenTheNewOneCantBeWritten) {
    const std::string path = WriteFile("p.htm", "old");
    WriteFile("p_20260102.htm", "left over");
    clsHTMLFile file;
    ASSERT_EQ(kSuccess, file.Load(path));
    ASSERT_EQ(kSuccess, file.Save());
    // The back-up is gone, the one that was left over isn't touched.
    EXPECT_EQ((std::vector<std::string>{"p.htm", "p_20260102.htm"}),
              environment->files->ListFiles(Folder(), "p*.htm"));

    ASSERT_EQ(kSuccess, file.Load(path));
    file.HTML = "new";
    const std::string lost = Path("missing\\q.htm");
    EXPECT_NE(kSuccess, file.Save(lost));
    EXPECT_EQ("old", ReadFile(path));
    ASSERT_FALSE(boxes->shown.empty());
    EXPECT_NE(std::string::npos, boxes->shown.back().text.find("Can't save file '"));
    EXPECT_EQ(std::string::npos, boxes->shown.back().text.find("restored"));

    // A page that may not be written stays as it was.
    const std::string native = environment->files->ToNative(path);
    std::filesystem::permissions(native, std::filesystem::perms::owner_read);
    EXPECT_NE(kSuccess, file.Save(path));
    EXPECT_EQ("Can't save file '" + native + "'.\r\nThe original file is restored.",
              boxes->shown.back().text);
    EXPECT_EQ("old", ReadFile(path));
    EXPECT_EQ((std::vector<std::string>{"p.htm", "p_20260102.htm"}),
              environment->files->ListFiles(Folder(), "p*.htm"));
}

} // namespace
} // namespace tovimar
