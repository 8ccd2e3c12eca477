#include "GenerationTest.h"

#include "generation/CTovimarCompiler.h"
#include "generation/HelpProjectText.h"
#include "generation/HelpUtilities.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "support/Golden.h"

namespace tovimar::test {
namespace {

class HelpProjectTest : public GenerationTest {
protected:
    HelpProjectTest() {
        Generator().HelpProjectTree().Load({}, false, false,
                                           "<Project key=\"P\" GeneratedHtmlFile=\"Welcome.htm\"/>");
        project->SetTitle("The \xC3\xA9 Shop");
        project->PicsSubfolderName = "images";
        for (const char* name :
             {"main.htm", "HH_TOC_JAVA.htm", "hh_index_java.htm", "b.v2.htm", "Welcome.htm", "A.htm"})
            WriteFile(std::string("help\\") + name, "<html></html>");
        for (const char* name : {"z.bmp", "b.jpg", "a.jpg", "a.png"})
            WriteFile(std::string("help\\images\\") + name, "x");
    }
};

TEST_F(HelpProjectTest, ProjectFileListsPagesAndPictures) {
    Parameters().AssociateHelpIndex = true;
    Parameters().AddSearchTabToHelp = true;
    Parameters().LanguageCode = " EN ";
    WriteFile("help\\A_20001017.htm", "as it was before a line came in");
    ASSERT_EQ(kSuccess, Generator().CreateHHPAndRelatedFiles({}));
    ExpectGolden("generation/Shop.hhp", HelpFile("Shop.hhp"));
    ExpectGolden("generation/Shop.txt", HelpFile("Shop.txt"));
}

TEST_F(HelpProjectTest, LinesThatDependOnOptions) {
    HelpProjectContents contents;
    contents.name = "My Shop";
    contents.associateIndex = false;
    contents.fullTextSearch = false;
    const std::string text = HelpProjectText(contents);
    EXPECT_NE(std::string::npos, text.find("\r\nindex file = \r\n"));
    EXPECT_NE(std::string::npos,
              text.find("\r\nFull-text search=No\r\nTitle=\r\n[Files]\r\n\r\n[ALIAS]\r\n\r\n[MAP]\r\n"));
    EXPECT_EQ("\r\n", TextPopupsText({}));

    Parameters().LanguageCode = "XX";
    Generator().CreateHHPAndRelatedFiles(Path("other.hhp"));
    EXPECT_EQ(std::string::npos, ReadFile(Path("other.hhp")).find("Language="));
}

TEST_F(HelpProjectTest, CompilerIsFoundThroughTheRegistry) {
    const std::string machine = "HKEY_LOCAL_MACHINE\\SOFTWARE\\";
    const std::string appPath = machine + "Microsoft\\Windows\\CurrentVersion\\App Paths\\hhw.exe";
    EXPECT_EQ("", GetHtmlHelpWorkshopExePath());
    WriteFile("hhw\\hhc.exe", "");
    auto& registry = *environment->registry;
    registry.Write(appPath, "Path", "\"" + Path("hhw") + "\"");
    EXPECT_EQ(Path("hhw\\"), GetHtmlHelpWorkshopExePath());
    registry.Write(appPath, "", Path("nowhere\\hhw.exe"));
    EXPECT_EQ("", GetHtmlHelpWorkshopExePath()) << "the default value goes before the named one";
    registry.Write(machine + "Classes\\hhp.file\\DefaultIcon", "", Path("hhw\\hhw.exe") + ",5");
    EXPECT_EQ(Path("hhw\\"), GetHtmlHelpWorkshopExePath());
    WriteFile("first\\hhc.exe", "");
    registry.Write("HKEY_CLASSES_ROOT\\hhp.file\\shell\\open\\command", "",
                   "\"" + Path("first\\HHW.EXE") + "\" %1");
    EXPECT_EQ(Path("first\\"), GetHtmlHelpWorkshopExePath());
    registry.Write("HKEY_CLASSES_ROOT\\hhp.file\\shell\\open\\command", "", Path("first\\hhw.exe"));
    EXPECT_EQ(Path("hhw\\"), GetHtmlHelpWorkshopExePath()) << "a command without its argument is dropped";
}

TEST_F(HelpProjectTest, CompilesAndCopiesWhenAskedFor) {
    CTovimarCompiler compiler;
    WriteFile("tools\\hhc.exe", "");
    environment->registry->Write(
        "HKEY_LOCAL_MACHINE\\SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\App Paths\\hhw.exe", "",
        Path("tools\\hhw.exe"));
    EXPECT_TRUE(compiler.CompileHtmlHelp());
    EXPECT_TRUE(processes->commandLines.empty()) << "not asked for";

    Parameters().CompileHTMLHelp = true;
    server.TestThatHtmlWorkshopInstalled();
    EXPECT_TRUE(compiler.CompileHtmlHelp());
    const std::string expected = "\"" + Path("tools\\hhc.exe") + "\" \"" + project->Folder + "Shop.hhp\"";
    EXPECT_EQ(std::vector<std::string>{expected}, processes->commandLines);

    EXPECT_TRUE(compiler.CopyCompiledHelp()) << "no file, nothing to copy";
    WriteFile("help\\Shop.chm", "new");
    EXPECT_TRUE(compiler.TestHelpFileWritable());
    WriteFile("Shop.chm", "old");
    EXPECT_TRUE(compiler.TestHelpFileWritable());
    EXPECT_EQ("old", ReadFile(Path("Shop.chm")));
    EXPECT_FALSE(environment->files->FileExists(Path("~Shop.tmp")));
    EXPECT_TRUE(compiler.CopyCompiledHelp());
    EXPECT_EQ("new", ReadFile(Path("Shop.chm")));

    Parameters().FolderForCopiedHelp = project->Folder;
    EXPECT_TRUE(compiler.CopyCompiledHelp()) << "onto itself";
    EXPECT_EQ("new", HelpFile("Shop.chm"));
}

} // namespace
} // namespace tovimar::test
