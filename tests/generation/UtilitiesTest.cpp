#include "generation/HelpUtilities.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

namespace tovimar::test {
namespace {

class UtilitiesTest : public EnvironmentTest {};

TEST_F(UtilitiesTest, SmallTexts) {
    EXPECT_EQ(GetTreeIconIndex("OPENEDBOOK"), 2);
    EXPECT_EQ(GetTreeIconIndex("report"), 6);
    EXPECT_EQ(GetTreeIconIndex("helptopic"), 0);
    EXPECT_TRUE(IsFormModuleName("form_Orders") && IsFormOrReportModuleName("REPORT_x"));
    EXPECT_FALSE(IsFormModuleName("Form") || IsReportModuleName("Form_x"));
    EXPECT_EQ(GetZoomStyleHtml(""), "");
    EXPECT_EQ(GetZoomStyleHtml("120%"),
              "<style type=\"text/css\" media=\"screen\">\r\nbody {zoom: 120%}\r\n</style>\r\n");
    const std::string exact(32, 'x');
    EXPECT_EQ(ShortenCaption(exact), exact);
    EXPECT_EQ(ShortenCaption(exact + "y"), exact + "...");
    EXPECT_TRUE(SplitToList("").empty());
    EXPECT_EQ(SplitToList("a||b"), (std::vector<std::string>{"a", "", "b"}));
}

TEST_F(UtilitiesTest, FoldersAndFiles) {
    EXPECT_EQ(MakeBackupForFolder(Path("help\\")), "") << "nothing to copy";
    const std::string page = WriteFile("help\\a.htm", "");
    WriteFile("help\\images\\b.jpg", "b");
    EXPECT_EQ(MakeBackupForFolder(Path("help\\")), Path("BAK_2026_01_02_03_04_05\\"));
    EXPECT_EQ(ReadFile(Path("BAK_2026_01_02_03_04_05\\images\\b.jpg")), "b");
    CopyFilesByMask(Path("help\\images\\"), Path("help\\"), "*.jpg");
    CopyFilesByMask(Path("none\\"), Path("help\\"), "*.*");
    EXPECT_EQ(ReadFile(Path("help\\b.jpg")), "b");
    EXPECT_EQ(GetPathAttributes(Path("help")), kAttributeFolder);
    EXPECT_EQ(GetPathAttributes(page), kAttributeFile);
    EXPECT_EQ(GetPathAttributes(Path("none")), -1);

    const std::string folder = Path("help\\");
    environment->files->WriteFile(page, "<a href=\"FILE:///" + folder + "x.htm\">\xE9</a><img src=\"" +
                                            folder + "y.jpg\"/>");
    EXPECT_TRUE(SetRelativePath(page));
    EXPECT_EQ(ReadFile(page), "<a href=\"x.htm\">\xE9</a><img src=\"y.jpg\"/>");
    EXPECT_FALSE(SetRelativePath(page));
}

TEST_F(UtilitiesTest, Programs) {
    EXPECT_GT(ShellExecute("C:\\a.htm", "open", "", false), 32);
    EXPECT_EQ(ShellAndWait("x.exe", 2), kSuccess);
    EXPECT_GT(ShellExecute("C:\\a b.exe", "open", "/q", true), 32);
    EXPECT_EQ(processes->opened, (std::vector<std::string>{"C:\\a.htm"}));
    EXPECT_EQ(processes->commandLines, (std::vector<std::string>{"x.exe", "\"C:\\a b.exe\" /q"}));
    processes->canOpen = false;
    processes->run = [](const std::string&) -> platform::Processes::Outcome { throw RaisedError(53, "no"); };
    EXPECT_EQ(ShellExecute("C:\\a.htm", "open", "", false), 31);
    EXPECT_EQ(ShellAndWait("x.exe", 2), 53);
}

} // namespace
} // namespace tovimar::test
