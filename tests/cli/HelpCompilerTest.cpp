#include "cli/Program.h"

#include <algorithm>
#include <gmock/gmock.h>

namespace tovimar::test {
namespace {

/// The help compiler beside the command.
class HelpCompilerTest : public ProgramTest {
protected:
    void SetUp() override {
        program = (fs::path(TOVIMAR_PROGRAM).parent_path() / "tools/hhc.exe").string();
        Write("my help/a.htm", "<html><head><title>A</title></head><body>a</body></html>");
        Write("my help/images/Pic.jpg", "picture");
    }
    void WriteProject(const std::string& files) {
        Write("my help/p.hhp",
              "[Options]\r\nCompiled file = p.chm\r\nDefault Topic = A.HTM\r\n[Files]\r\n" + files +
                  "\r\n[ALIAS]\r\n[MAP]\r\n#include p.h\r\n[TEXT POPUPS]\r\n#include p.txt\r\n");
    }
    /// What lies in the project's folder beside its own files.
    std::vector<std::string> Made() const {
        std::vector<std::string> names = FilesBelow(Folder() / "my help");
        std::erase_if(names, [](const std::string& name) {
            return name == "a.htm" || name == "images/Pic.jpg" || name == "p.hhp";
        });
        return names;
    }
};

TEST_F(HelpCompilerTest, NamesAreFoundAsTheyStandOnTheDisk) {
    WriteProject("A.htm\r\nIMAGES\\pic.jpg\r\n");
    Run({"my help/p.hhp"}).ExpectExit(0);
    EXPECT_THAT(Made(), ::testing::ElementsAre("p.chm")) << "compiled beside the project, nothing else left";
    EXPECT_NE(ReadWhole(Folder() / "my help/p.chm").find("/images/Pic.jpg"), std::string::npos);
}

TEST_F(HelpCompilerTest, AMissingFileIsAComplaintNotTheEnd) {
    WriteProject("a.htm\r\ngone.htm\r\n");
    Run({"my help/p.hhp"}).ExpectExit(1).ExpectErrorsHold("'gone.htm' is in the project but not on the disk");
    EXPECT_THAT(Made(), ::testing::ElementsAre("p.chm"));
    WriteProject("gone.htm\r\n");
    Run({"my help/p.hhp"}).ExpectExit(1);
}

TEST_F(HelpCompilerTest, TheOtherCompilerWorksWhereItIsAskedFor) {
    if (!IsInstalled("chmcmd"))
        GTEST_SKIP() << "chmcmd of the package fp-utils isn't installed";
    variables["TOVIMAR_HELP_COMPILER"] = "chmcmd";
    WriteProject("A.htm\r\nIMAGES\\pic.jpg\r\ngone.htm\r\n");
    Run({"my help/p.hhp"}).ExpectExit(1).ExpectErrorsHold("'gone.htm' is in the project but not on the disk");
    EXPECT_THAT(Made(), ::testing::ElementsAre("p.chm"));
}

TEST_F(HelpCompilerTest, KeepsTheOldFileWhenNothingIsCompiled) {
    Write("my help/p.chm", "old");
    WriteProject("gone.htm\r\n");
    Run({"my help/p.hhp"}).ExpectExit(1).ExpectErrorsHold("lists no file that exists");
    EXPECT_EQ(ReadWhole(Folder() / "my help/p.chm"), "old");
    Write("my help/pages/b.htm", "<a href=../a.htm><a href=../../away.htm>\n<img src=none.gif>");
    WriteProject("pages\\b.htm\r\n");
    Run({"my help/p.hhp"})
        .ExpectExit(0)
        .ExpectErrorsHold("hhc: warning: pages/b.htm(1): '../../away.htm' leads out of the project\n"
                          "hhc: warning: pages/b.htm(2): 'none.gif' isn't on the disk\n");
    EXPECT_NE(ReadWhole(Folder() / "my help/p.chm").find("/a.htm"), std::string::npos);
}

TEST_F(HelpCompilerTest, NoProjectOrNoCompilerIsTold) {
    Run({"my help/none.hhp"}).ExpectExit(2);
    WriteProject("a.htm\r\n");
    variables["TOVIMAR_HELP_COMPILER"] = "chmcmd";
    searchPath = "/nowhere";
    Run({"my help/p.hhp"}).ExpectExit(2).ExpectErrorsHold("fp-utils");
    EXPECT_THAT(Made(), ::testing::IsEmpty());
}

} // namespace
} // namespace tovimar::test
