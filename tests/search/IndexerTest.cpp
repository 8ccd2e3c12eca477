#include "cli/Program.h"

namespace tovimar::test {
namespace {

/// The indexer as the web help calls it.
class IndexerTest : public ProgramTest {
protected:
    IndexerTest() {
        program = (fs::path(TOVIMAR_PROGRAM).parent_path() / "tools/ss.exe").string();
        fs::create_directory(Folder() / "help");
    }
    Outcome Index(const std::vector<std::string>& left = {}) {
        std::vector<std::string> arguments{
            "-d" + (Folder() / "help").string(), "-ehtm", "-s0", "-w1", "-p1", "-m1", "-u3", "-n4"};
        arguments.insert(arguments.end(), left.begin(), left.end());
        arguments.emplace_back("-x");
        return Run(arguments);
    }
    std::string Page() const { return ReadWhole(Folder() / "help/ss.html"); }
};

TEST_F(IndexerTest, SameTopicsGiveTheSamePageAndLeftOutOnesDontCount) {
    Write("help/b.htm", "beta");
    Write("help/A.HTM", "alpha");
    Index().ExpectExit(0).ExpectErrors("");
    const auto page = Page();
    Write("help/My TOC.htm", "gamma");
    Write("help/MAIN.htm", "gamma");
    Write("help/c.html", "gamma");
    Write("help/sub/d.htm", "gamma");
    Index({"-imain.htm", "-iMy", "TOC.htm"}).ExpectExit(0);
    EXPECT_EQ(Page(), page) << "a name with a blank comes as two arguments";
    Index().ExpectExit(0);
    EXPECT_NE(Page(), page);
    EXPECT_EQ(FilesBelow(Folder() / "help").size(), 7U) << "nothing else is left";
}

TEST_F(IndexerTest, FailuresNameTheFileAndKeepTheOldPage) {
    Write("help/ss.html", "old");
    Write("help/big.htm", "");
    fs::resize_file(Folder() / "help/big.htm", (64U << 20U) + 1);
    Index().ExpectExit(1).ExpectErrors(
        "ss.exe: '<FOLDER>/help/big.htm' is too large for a topic: more than 64 MB\n");
    EXPECT_EQ(Page(), "old");
    fs::remove(Folder() / "help/big.htm");
    fs::remove(Folder() / "help/ss.html");
    Write("help/ss.html/in the way", "");
    Index().ExpectExit(1).ExpectErrors("ss.exe: '<FOLDER>/help/ss.html' can't be replaced: Is a directory\n");
    EXPECT_EQ(FilesBelow(Folder() / "help"), std::vector<std::string>{"ss.html/in the way"});
    Run({"-d<none>"}).ExpectExit(1).ExpectErrors("ss.exe: '<none>' is no folder\n");
    Run({"-d", "-ehtm"}).ExpectExit(2).ExpectErrorsHold("Unknown argument: -d\n");
}

} // namespace
} // namespace tovimar::test
