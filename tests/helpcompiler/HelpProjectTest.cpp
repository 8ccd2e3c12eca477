#include "helpcompiler/HelpProject.h"
#include "Tools.h"
#include "platform/text/Text.h"

#include <gmock/gmock.h>

using namespace tovimar::helpcompiler;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

namespace {

/// The file that a reference of the page "docs/a.htm" leads to; "outside" for one beyond the project.
std::string Target(std::string_view reference) {
    bool outside = false;
    const auto file = FileOfReference("docs/a.htm", reference, outside);
    return outside ? "outside" : file.value_or("none");
}

HelpProject Read(const Folder& folder, std::string_view text, std::vector<std::string>* told = nullptr) {
    ProjectFolder files(folder.Path());
    return ReadHelpProject(text, "p.hhp", files, [&](const Message& message) {
        if (told != nullptr)
            told->push_back(std::to_string(message.line) + " " + message.text);
    });
}

} // namespace

TEST(ProjectFolderTest, FindsNamesInAnyCaseAndWithAnySlash) {
    const Folder folder;
    folder.Write("Pics/Big One.PNG", "x");
    folder.Write("both.htm", "1");
    folder.Write("Both.htm", "2");
    ProjectFolder files(folder.Path());
    EXPECT_EQ(files.Find("pics\\big one.png"), "Pics/Big One.PNG");
    EXPECT_EQ(files.Find("./PICS//Big One.PNG"), "Pics/Big One.PNG");
    EXPECT_EQ(files.Find("both.htm"), "both.htm");
    EXPECT_EQ(files.Find("BOTH.HTM"), "Both.htm") << "of two the same one everywhere";
    EXPECT_FALSE(files.Find("Pics")) << "a folder is no file";
    EXPECT_FALSE(files.Find("pics/none.png"));
    EXPECT_FALSE(files.Find(""));
    EXPECT_EQ(LowerExtension("a.b/C.HTM"), "htm");
    EXPECT_EQ(LowerExtension("a.b/c"), "");
}

TEST(ProjectFolderTest, ReferencesLeadToFiles) {
    EXPECT_EQ(Target("b.htm#x"), "docs/b.htm");
    EXPECT_EQ(Target("..\\pics\\a%20b.png?1"), "pics/a b.png");
    EXPECT_EQ(Target("/top.htm"), "top.htm");
    EXPECT_EQ(Target("./c/./d.htm"), "docs/c/d.htm");
    EXPECT_EQ(Target("100%.htm"), "docs/100%.htm");
    EXPECT_EQ(Target("../../up.htm"), "outside");
    for (const char* elsewhere : {"#here", "", "http://x/y.htm", "mailto:a@b", "JavaScript:f()", "//server/x",
                                  "ms-its:other.chm::/a.htm"})
        EXPECT_EQ(Target(elsewhere), "none") << elsewhere;
}

TEST(HelpProjectTest, ReadsOptionsFilesAndNumbers) {
    const Folder folder;
    folder.Write("ids.h", "#define IDH_A 10 // first\r\n#include more.h\r\n");
    folder.Write("more.h", "#define IDH_B 0x20\r\n#define IDH_NOWHERE 30\r\n#include ids.h\r\n");
    std::vector<std::string> told;
    const HelpProject project = Read(
        folder,
        "; a comment\r\n[OPTIONS]\r\n TITLE = A = b \r\nCompiled file=out\\p.chm\r\nLanguage=0x407 German\r\n"
        "Full-text search=YES\r\nBinary index=No\r\nnonsense\r\n[FILES]\r\n\"a b.htm\"\r\n\r\nc.htm\r\n"
        "[alias]\r\nIDH_A = docs\\a.htm ; why\r\nIDH_B=b.htm#x\r\n[MAP]\r\n#include \"ids.h\"\r\n"
        "[MERGE FILES]\r\nother.chm\r\n[WINDOWS]\r\nmain=\"T\"\r\nbroken\r\n",
        &told);
    EXPECT_EQ(project.help.title, "A = b");
    EXPECT_EQ(project.compiledFile, "out/p.chm");
    EXPECT_EQ(project.help.language, 0x407U);
    EXPECT_TRUE(project.help.fullTextSearch);
    EXPECT_FALSE(project.help.binaryIndex);
    EXPECT_THAT(project.files, ElementsAre("a b.htm", "c.htm"));
    ASSERT_GE(project.help.contexts.size(), 2U);
    EXPECT_EQ(project.help.contexts[0].id, 10U);
    EXPECT_EQ(project.help.contexts[0].target, "docs/a.htm");
    EXPECT_EQ(project.help.contexts[1].id, 32U);
    EXPECT_EQ(project.help.contexts[1].target, "b.htm#x");
    EXPECT_THAT(project.help.mergedFiles, ElementsAre("other.chm"));
    EXPECT_EQ(project.help.windows.size(), 1U);
    EXPECT_THAT(told, ElementsAre("17 'ids.h' is included by files that include each other"));
}

TEST(HelpProjectTest, TextIsOfTheLanguageOrUnicode) {
    const Folder folder;
    const std::string text = "[OPTIONS]\nTitle=Обзор\nLanguage=0x419\n[FILES]\nФайл.htm\n";
    const std::string bytes = tovimar::text::CodePage(1251).Encode(text);
    for (const std::string& source : {bytes, text, "\xEF\xBB\xBF" + text}) {
        const HelpProject project = Read(folder, source);
        EXPECT_EQ(project.help.title, "\xCE\xE1\xE7\xEE\xF0");
        EXPECT_THAT(project.files, ElementsAre("Файл.htm"));
    }
    EXPECT_EQ(Read(folder, "").compiledFile, "p.chm");
    EXPECT_EQ(Read(folder, "[OPTIONS").help.language, 0x409U);
}
