#include "project/BackupPages.h"
#include "project/ProjectTest.h"

#include "platform/text/Text.h"
#include "project/WebHelpFiles.h"

#include <cstdlib>
#include <filesystem>
#include <memory>

namespace tovimar::test {
namespace {

class WebHelpTest : public ProjectTest {
protected:
    /// An installation with just what the web help takes.
    void Install(const std::string& frame) {
        SetInstallation(Path("inst\\"));
        WriteFile("inst\\Templates\\Localized\\EN\\main.htm", frame);
        WriteFile("inst\\Templates\\Common\\toc.js", "js");
        WriteFile("inst\\Templates\\Common\\Office.css", "css");
        WriteFile("inst\\Templates\\Common\\Title.htm", "not copied");
        WriteFile("inst\\Templates\\Common\\images\\book.gif", "gif");
        WriteFile("inst\\ss.exe", "");
    }
};

TEST_F(WebHelpTest, OptionsAreSortedAndOneCaptionLeadsToOnePage) {
    std::string lines = "        <option value=\"b.htm\">beta</option>\r\n"
                        "        <option value=\"z.htm\">Zeta</option>\r\n\r\n"
                        "<option value=\"a.htm\">Alpha</option>\r\n"
                        "        <option value=\"other.htm\">BETA</option>\r\n";
    CHelpPrjTree::SortIndexOptions(lines, 2);
    EXPECT_EQ(lines, "  <option value=\"a.htm\">Alpha</option>\r\n"
                     "  <option value=\"b.htm\">beta</option>\r\n"
                     "  <option value=\"z.htm\">Zeta</option>");
}

TEST_F(WebHelpTest, ScriptGoesInAndOut) {
    std::string page = "<html></html>\r\n";
    AddWebHelpScript(page);
    EXPECT_EQ(page.rfind("<html></html>\r\n\r\n\r\n<script type=\"text/javascript\" id=\"wbh\">", 0), 0U)
        << page;
    const auto path = WriteFile("p.htm", page);
    AddWebHelpScriptToFile(path);
    EXPECT_EQ(ReadFile(path), page) << "it never stands twice";
    EXPECT_TRUE(RemoveWBHScript(path));
    EXPECT_EQ(ReadFile(path), "<html></html>\r");
    EXPECT_FALSE(RemoveWBHScript(path));
    const auto about = WriteFile("q.htm", "<HTML>about wBh</HTML>");
    AddWebHelpScriptToFile(about);
    EXPECT_EQ(ReadFile(about), "<HTML>about wBh</HTML>");
    EXPECT_FALSE(RemoveWBHScript(Path("absent.htm")));
    AddWebHelpScriptToFile(Path("absent.htm"));
    EXPECT_FALSE(environment->files->FileExists(Path("absent.htm")));
    const auto inside = WriteFile("r.htm", "<html><script>1</script></html>\r\n");
    EXPECT_FALSE(RemoveWBHScript(inside)) << "only a script behind the page is the web help's";
    EXPECT_EQ(ReadFile(inside), "<html><script>1</script></html>\r\n");
}

TEST_F(WebHelpTest, FramePageHoldsTreeAndOptions) {
    Install("[{{StyleSheetLinkHtml}}][{{charset}}][{{ProjectTree}}][{{Options}}][{{rootpage}}]");
    parameters.Charset = "windows-1252";
    parameters.SetCSSFullPath("Office.css");
    LoadTree("<Project GeneratedHtmlFile='Title.htm'><A key='a' caption='One' GeneratedHtmlFile='a.htm' "
             "Indexes='two'/><B key='b' caption='ONE' GeneratedHtmlFile='b.htm'/></Project>");
    EXPECT_EQ(tree.MakeJavaHelp(*project), 0) << LastBox();
    EXPECT_EQ(ReadFile(Path("main.htm")),
              "[<link href=\"Office.css\" type=\"text/css\" rel=\"stylesheet\" >][windows-1252]["
              "<UL>\r\n"
              "                <li>  <a href=\"a.htm\" target=\"right\">One</a> </li>\r\n"
              "                <li>  <a href=\"b.htm\" target=\"right\">ONE</a> </li>\r\n"
              "        </UL>\r\n][<option value=\"a.htm\">One</option>\r\n"
              "        <option value=\"a.htm\">two</option>][Title.htm]");
    EXPECT_TRUE(environment->files->FileExists(Path("toc.js")));
    EXPECT_TRUE(environment->files->FileExists(Path("Office.css")));
    EXPECT_TRUE(environment->files->FileExists(Path("images\\book.gif")));
    EXPECT_FALSE(environment->files->FileExists(Path("Title.htm")));
    const auto folder = Folder().substr(0, Folder().size() - 1);
    ASSERT_EQ(processes->commandLines.size(), 1U);
    EXPECT_EQ(processes->commandLines[0],
              '"' + Path("inst\\ss.exe") + "\" -d\"" + folder +
                  "\" -ehtm -s0 -w1 -p1 -m1 -u3 -n4 -ihh_index_java.htm -ihh_toc_java.htm -imain.htm "
                  "-iSalesTOC.htm -x");
}

TEST_F(WebHelpTest, BackupsOfPagesAreNotSearched) {
    Install("");
    LoadTree("<Project GeneratedHtmlFile='Title.htm'><A key='a' "
             "GeneratedHtmlFile='Sales_20261123.htm'/></Project>");
    for (const char* page :
         {"Title.htm", "Title_20261123.htm", "title_202611232.htm", "Title_20261323.htm", "Title_2026.htm",
          "Gone_20261123.htm", "Sales.htm", "Sales_20261123.htm", "_20261123.htm", "Title_20261123x.htm"})
        WriteFile(page, "");
    EXPECT_EQ(BackupPages(tree, environment->files->ListFiles(Folder(), "*.htm")),
              (std::vector<std::string>{"Title_20261123.htm", "title_202611232.htm"}))
        << "dates, beside the page, and no topic of their own";
    EXPECT_EQ(tree.MakeJavaHelp(*project), 0) << LastBox();
    EXPECT_TRUE(
        processes->commandLines[0].ends_with(" -iSalesTOC.htm -iTitle_20261123.htm -ititle_202611232.htm -x"))
        << processes->commandLines[0];
}

TEST_F(WebHelpTest, FramePageOfNothing) {
    Install("[{{ProjectTree}}][{{Options}}][{{projecttree}}]");
    LoadTree("<Project GeneratedHtmlFile='Title.htm'/>");
    WriteFile("main.htm", "of an earlier run");
    EXPECT_EQ(tree.MakeJavaHelp(*project), 0) << LastBox();
    EXPECT_EQ(ReadFile(Path("main.htm")), "[][][]");
    environment->files->DeleteFile(Path("inst\\Templates\\Localized\\EN\\main.htm"));
    EXPECT_EQ(tree.MakeJavaHelp(*project), 0) << LastBox();
    EXPECT_EQ(ReadFile(Path("main.htm")), "");
}

TEST_F(WebHelpTest, TagsAreCutAtTheirFirstBarAndKeptInOrder) {
    const auto page = WriteFile("t.htm", "{{A}}-{{b}}-{{C}}");
    EXPECT_EQ(FillFileFromTemplate(page, {}, {" {{a}} | x|{{B}} ", "no bar", "{{B}}|two", "{{C}}|"}),
              "x|two-two-");
    EXPECT_EQ(FillFileFromTemplate(Path("none.htm"), {}, {"{{a}}|x"}), "");
    EXPECT_THROW(FillFileFromTemplate(page, Path("no folder\\of\\t.htm"), {}), RaisedError);
}

TEST_F(WebHelpTest, MissingSearchEngineIsReportedAfterTheFramePage) {
    Install("x");
    environment->files->DeleteFile(Path("inst\\ss.exe"));
    environment->folders.program = Path("nowhere\\");
    LoadTree("<Project/>");
    EXPECT_EQ(tree.MakeJavaHelp(*project), 30001);
    EXPECT_NE(LastBox().find("Site search engine (ss.exe) not found in '"), std::string::npos) << LastBox();
    EXPECT_TRUE(environment->files->FileExists(Path("main.htm")));
}

/// Runs the real indexer that stands beside the program of this build.
TEST_F(WebHelpTest, SearchPageOfTheRealIndexer) {
    const auto engine = std::filesystem::path(TOVIMAR_PROGRAM).parent_path() / "tools" / "ss.exe";
    if (!std::filesystem::exists(engine))
        GTEST_SKIP() << "the search indexer isn't built: " << engine;
    WriteFile("a.htm",
              "<html><title>Orders</title><body>Enter <b>orders</b><script>hidden()</script></body></html>");
    WriteFile("b.htm",
              "<html><meta charset=\"windows-1251\"><body>\xcf\xf0\xe8\xe2\xe5\xf2 &lt;/script&gt; orders"
              "</body></html>");
    WriteFile("main.htm", "<html>orders</html>");
    SetInstallation(Path("inst\\"));
    WriteFile("inst\\ss.exe", "");
    project->Name = "My Sales";
    WriteFile("My SalesTOC.htm", "orders");
    auto real = platform::MakeRealEnvironment({NativeFolder() + "/.d", NativeFolder() + "/.c", {}});
    processes->run = [&](const std::string& line) {
        const auto program = environment->files->FromNative(engine.string());
        return real->processes->RunAndWait('"' + program + line.substr(line.find("\" -d")));
    };
    ASSERT_TRUE(tree.BuildSiteSearch(*project));
    auto page = ReadFile(Path("ss.html"));
    const auto start = page.find("unpack(\"") + 8;
    ASSERT_GT(start, 8U) << page;
    page.replace(start, page.find('"', start) - start, "INDEX");
    ExpectGolden("ss.html", page);
}

TEST_F(WebHelpTest, PatchesOnlyWhatIsThere) {
    const std::string kept = "<FORM>\n</form>\r\n| <a href=\"x\">Help</a> | more\r\n\xff";
    const auto path = WriteFile("ss.html", kept);
    CHelpPrjTree::PatchSiteSearchPage(path);
    EXPECT_EQ(ReadFile(path), kept) << "its own line ends behind the bar, the form has other line ends";
    WriteFile("ss.html", "a\r\n| <A HREF=\"h.htm\">HELP</A> |\r\nFUNCTION C(l){\r\n if(BW && !BW.closed) "
                         "{BW.location.href=l;BW.focus();}\r\n else BW=window.open(l,\"\");\r\n}");
    CHelpPrjTree::PatchSiteSearchPage(path);
    EXPECT_EQ(ReadFile(path), "a\r\nfunction C(l){\r\n location.href=l;\r\n}");
    CHelpPrjTree::PatchSiteSearchPage(Path("absent.html"));
    EXPECT_FALSE(environment->files->FileExists(Path("absent.html")));
}

} // namespace
} // namespace tovimar::test
