#include "helpcompiler/Compiler.h"
#include "Tools.h"
#include "platform/Error.h"
#include "support/SearchReader.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <random>
#include <set>

using namespace tovimar::helpcompiler;

namespace {

std::string SitemapText(const std::vector<std::pair<std::string, std::string>>& entries) {
    std::string text = "<html><body><ul>\r\n";
    for (const auto& [name, page] : entries)
        text += "<li><object type=\"text/sitemap\"><param name=\"Name\" value=\"" + name +
                "\"><param name=\"Local\" value=\"" + page + "\"></object>\r\n";
    return text + "</ul></body></html>\r\n";
}

std::vector<std::string> CompileIn(const Folder& folder, const CompileOptions& options = {}) {
    std::vector<std::string> told;
    Compile(folder.Path() / "p.hhp", options, [&](const Message& message) {
        told.push_back(message.file + "(" + std::to_string(message.line) + "): " + message.text);
    });
    return told;
}

std::set<std::string> FilesBelow(const std::filesystem::path& folder) {
    std::set<std::string> names;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder))
        if (entry.is_regular_file())
            names.insert(std::filesystem::relative(entry.path(), folder).generic_string());
    return names;
}

/// A project that shows most of what there is.
void WriteProject(const Folder& folder) {
    folder.Write("p.hhp",
                 "[OPTIONS]\r\nCompiled file=p.chm\r\nContents file=p.hhc\r\nIndex file=p.hhk\r\n"
                 "Default topic=a.htm\r\nLanguage=0x409 English\r\nTitle=Test\r\nFull-text search=Yes\r\n"
                 "[FILES]\r\na.htm\r\nb.htm\r\n[ALIAS]\r\nIDH_A=a.htm\r\n[MAP]\r\n#include p.h\r\n");
    folder.Write("p.h", "#define IDH_A 10\r\n");
    folder.Write("a.htm",
                 "<html><head><title>First page</title><link rel=\"stylesheet\" href=\"s.css\"></head>"
                 "<body><p>alpha <img src=\"pics/a.png\"></body></html>");
    folder.Write("b.htm", "<html><head><title>Second page</title></head><body>beta</body></html>");
    folder.Write("s.css", "p {color: red}");
    folder.Write("pics/a.png", std::string("\x89PNG\0\1\2", 7));
    folder.Write("p.hhc", SitemapText({{"First", "a.htm"}, {"Second", "b.htm"}}));
    folder.Write("p.hhk", SitemapText({{"alpha", "a.htm"}}));
}

} // namespace

/// Against another compiler: the same files with the same bytes; what differs is known and told here.
TEST(CompilerTest, HoldsWhatTheOtherCompilerHolds) {
    if (std::system("command -v chmcmd >/dev/null") != 0)
        GTEST_SKIP() << "chmcmd of the package fp-utils isn't installed";
    const Folder folder;
    WriteProject(folder);
    ASSERT_TRUE(folder.Run("chmcmd p.hhp")) << folder.Read("printed");
    ASSERT_TRUE(folder.Run("7z x -otheirs p.chm"));
    EXPECT_THAT(CompileIn(folder), ::testing::IsEmpty());
    ASSERT_TRUE(folder.Run("7z x -oours p.chm"));
    auto theirs = FilesBelow(folder.Path() / "theirs");
    theirs.erase("_#_README_#_"); // its advertisement
    auto ours = FilesBelow(folder.Path() / "ours");
    for (const char* always : {"#IDXHDR", "$WWKeywordLinks/Property", "$WWAssociativeLinks/Property"})
        EXPECT_TRUE(ours.erase(always) == 1 && theirs.erase(always) < 2) << always;
    // Theirs takes what a page needs only where the project lists it.
    for (const char* needed : {"pics/a.png", "s.css"})
        EXPECT_TRUE(ours.erase(needed) == 1 && theirs.erase(needed) < 2) << needed;
    EXPECT_EQ(ours, theirs);
    for (const char* same : {"a.htm", "b.htm", "p.hhc", "p.hhk", "$OBJINST", "#ITBITS"})
        EXPECT_EQ(folder.Read("ours/" + std::string(same)), folder.Read("theirs/" + std::string(same)))
            << same;
    EXPECT_EQ(folder.Read("ours/pics/a.png"), folder.Read("pics/a.png"));
    EXPECT_EQ(folder.Read("ours/#IVB").substr(0, 8), std::string("\x08\0\0\0\x0A\0\0\0", 8));
}

TEST(CompilerTest, StopWordsAreNotSearched) {
    const Folder folder;
    WriteProject(folder);
    folder.Write("stop.txt", "The\r\nof\r\n");
    folder.Write("b.htm", "<title>The list of orders</title>the end");
    folder.Write(
        "p.hhp",
        "[OPTIONS]\nFull-text search=Yes\nFull text search stop list file=Stop.txt\n[FILES]\nb.htm\n");
    EXPECT_THAT(CompileIn(folder), ::testing::IsEmpty());
    ASSERT_TRUE(folder.Run("7z x -ox p.chm"));
    const SearchReader search(folder.Read("x/$FIftiMain"));
    EXPECT_EQ(search.Words(), (std::vector<std::string>{"end", "list", "orders"}));
    EXPECT_TRUE(search.Find("orders").at(0)[0].title);
    EXPECT_EQ(search.Find("end").at(0)[0].places, std::vector<std::uint32_t>{2});
}

TEST(CompilerTest, GivesTheSameBytesEachTimeAndOnAnyNumberOfThreads) {
    const Folder folder;
    WriteProject(folder);
    CompileIn(folder, {1, std::nullopt});
    const std::string first = folder.Read("p.chm");
    CompileIn(folder, {5, std::nullopt});
    EXPECT_TRUE(folder.Read("p.chm") == first);
    CompileIn(folder, {0, 77});
    EXPECT_EQ(folder.Read("p.chm").substr(0x10, 4), std::string("\x4D\0\0\0", 4));
    folder.Write("b.htm", "changed");
    CompileIn(folder);
    EXPECT_NE(folder.Read("p.chm").substr(0x10, 4), first.substr(0x10, 4));
}

TEST(CompilerTest, LargeFilesGoThroughInPieces) {
    const Folder folder;
    WriteProject(folder);
    std::minstd_rand random(7);
    std::string picture(std::size_t{12} << 20, '\0');
    for (char& byte : picture)
        byte = static_cast<char>(random() >> 8U);
    std::string words;
    while (words.size() < std::size_t{3} << 20)
        words += "word" + std::to_string(random() % 5000) + ' ';
    folder.Write("large.jpg", picture);
    folder.Write("plain.png", std::string(300000, 'x')); // no picture at all, and worth its squeezing
    folder.Write("words.txt", words);
    folder.Write("none.gif", "");
    folder.Write("p.hhp", "[FILES]\na.htm\nlarge.jpg\nwords.txt\nplain.png\nnone.gif\n");
    EXPECT_THAT(CompileIn(folder), ::testing::IsEmpty());
    ASSERT_TRUE(folder.Run("7z x -ox p.chm")) << folder.Read("printed");
    EXPECT_TRUE(folder.Read("x/large.jpg") == picture);
    EXPECT_TRUE(folder.Read("x/words.txt") == words);
    EXPECT_EQ(folder.Read("x/none.gif"), "");
    EXPECT_LT(folder.Read("p.chm").size(), picture.size() + words.size() / 2);
}

/// Empty files, the longest names that Windows knows, and one that no entry of the directory can hold.
TEST(CompilerTest, NamesAndFilesOfAnyLength) {
    const Folder folder;
    const std::string deep = std::string(120, 'd') + "/" + std::string(100, 'e') + "/";
    const std::string longest = deep + std::string(34, 'n') + ".htm";
    ASSERT_EQ(longest.size(), 260U);
    std::string beyond;
    while (beyond.size() < 1100)
        beyond += std::string(200, 'x') + "/";
    beyond += "a.htm";
    folder.Write(longest, "<title>Long</title>name");
    folder.Write(beyond, "<title>Longer</title>");
    std::string project = "[OPTIONS]\nFull-text search=Yes\n[FILES]\n" + longest + "\n" + beyond + "\n";
    for (const char* empty : {"none.htm", "none.css", "none.png", "none.txt"}) {
        folder.Write(empty, "");
        project += std::string(empty) + "\n";
    }
    folder.Write("p.hhp", project);
    EXPECT_THAT(CompileIn(folder),
                ::testing::ElementsAre("p.hhp(5): '" + beyond + "' has a name that can't be stored"));
    ASSERT_TRUE(folder.Run("7z x -ox p.chm && extract_chmLib p.chm y")) << folder.Read("printed");
    for (const char* reader : {"x/", "y/"}) {
        EXPECT_EQ(folder.Read(reader + longest), "<title>Long</title>name");
        EXPECT_TRUE(std::filesystem::is_empty(folder.Path() / reader / "none.png"));
    }
    EXPECT_EQ(folder.Read("x/#TOPICS").size(), 2 * 16U) << "no topic without its page";
    EXPECT_EQ(SearchReader(folder.Read("x/$FIftiMain")).Words(), (std::vector<std::string>{"long", "name"}));
}

/// What is compressed waits in the folder of the result, which may be another than the project's: that one
/// may be read-only. When the folder isn't there, this shows in the first megabytes.
TEST(CompilerTest, WritesBesideItsTargetAlone) {
    const Folder folder;
    WriteProject(folder);
    std::minstd_rand random(3);
    std::string large(std::size_t{13} << 20, '\0');
    for (char& byte : large)
        byte = static_cast<char>(random() >> 8U);
    folder.Write("project/large.jpg", large);
    folder.Write("project/p.hhp", "[OPTIONS]\nCompiled file=../none/p.chm\n[FILES]\nlarge.jpg\n");
    try {
        Compile(folder.Path() / "project/p.hhp", {}, [](const Message&) {});
        FAIL() << "written into a folder that isn't there";
    } catch (const tovimar::RaisedError& error) {
        EXPECT_TRUE(std::string(error.what()).ends_with("/none'")) << error.what();
    }
    EXPECT_EQ(FilesBelow(folder.Path() / "project"), (std::set<std::string>{"large.jpg", "p.hhp"}));
}

TEST(CompilerTest, InterruptedItLeavesTheEarlierFile) {
    const Folder folder;
    WriteProject(folder);
    folder.Write("p.chm", "earlier");
    const auto names = [&] {
        std::set<std::string> all;
        for (const auto& entry : std::filesystem::directory_iterator(folder.Path()))
            all.insert(entry.path().filename().string());
        return all;
    };
    const auto before = names();
    int last = 0;
    for (;; ++last) {
        int asked = 0;
        const auto stop = [&] { return asked++ == last; };
        try {
            Compile(folder.Path() / "p.hhp", {0, std::nullopt, stop}, [](const Message&) {});
            break;
        } catch (const Interrupted&) {
            ASSERT_EQ(folder.Read("p.chm"), "earlier");
            ASSERT_EQ(names(), before);
        }
    }
    EXPECT_GT(last, 4);
    EXPECT_GT(folder.Read("p.chm").size(), 5000U);
}

TEST(CompilerTest, TellsWhatIsWrongAndWhere) {
    const Folder folder;
    WriteProject(folder);
    folder.Write(
        "p.hhp",
        "[OPTIONS]\nContents file=p.hhc\nIndex file=none.hhk\n[FILES]\na.htm\ngone.htm\n"
        "[ALIAS]\nA=a.htm\nA=b.htm\nB=away.htm\nC=b.htm\n[MAP]\n#define A 1\n#define B 2\n#define C 0x1\n"
        "#include none.h\n");
    folder.Write("a.htm",
                 "<a href=\"http://x/y\">\n<a href=\"../up.htm\"><a href=\"b.htm#x\"><a href=\"no%20.htm\">");
    folder.Write("p.hhc", SitemapText({{"&#322;", "a.htm"}, {"x", "lost.htm"}}));
    EXPECT_THAT(CompileIn(folder), ::testing::UnorderedElementsAre(
                                       "p.hhp(9): the alias A stands for 'a.htm' already, since line 8",
                                       "p.hhp(16): 'none.h' isn't on the disk",
                                       "p.hhp(6): 'gone.htm' is in the project but not on the disk",
                                       "p.hhp(3): 'none.hhk' is in the project but not on the disk",
                                       "p.hhc(2): '&#322;' has characters beyond code page 1252",
                                       "p.hhc(3): 'lost.htm' isn't on the disk",
                                       "p.hhp(10): 'away.htm' has a number but isn't on the disk",
                                       "p.hhp(11): the number 1 stands for 'a.htm' and for 'b.htm'; a "
                                       "program that asks for it gets the first",
                                       "a.htm(2): '../up.htm' leads out of the project",
                                       "a.htm(2): 'no%20.htm' isn't on the disk"));
    EXPECT_FALSE(folder.Read("p.chm").empty()) << "named after the project";
}
