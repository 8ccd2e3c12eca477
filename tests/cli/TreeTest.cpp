#include "cli/HelpFolder.h"
#include "cli/Program.h"

#include <gmock/gmock.h>

#include <map>
#include <set>
#include <sstream>

namespace tovimar::test {
namespace {

using ::testing::AllOf;
using ::testing::HasSubstr;
using ::testing::Not;

/// A help that a writer rearranges and a developer's application outgrows.
class TreeTest : public ProgramTest {
protected:
    void SetUp() override {
        Write("shop/forms/Orders.form", FormExport("Orders"));
        Write("shop/forms/Search.form", FormExport("Search"));
        Run({"generate", "shop", "--output", "help", "--no-compile"}).ExpectExit(0);
    }
    std::string Contents() { return Run({"contents", "help"}).ExpectExit(0).output; }
};

TEST_F(TreeTest, OperationsAreSavedTogetherOrNotAtAll) {
    Run({"tree", "help", "move", "Forms/Orders", "Tables", "then", "new", "Forms", "First steps"})
        .ExpectExit(0);
    EXPECT_THAT(Contents(),
                AllOf(HasSubstr("  Tables           Tables.htm\n    Orders         shop_Form_Orders.htm\n"),
                      HasSubstr("    First steps    First_steps.htm\n")));
    EXPECT_TRUE(fs::exists(Folder() / "help/First_steps.htm"));
    const auto before = ReadWhole(Folder() / "help/shop.tvp");
    Run({"tree", "help", "up", "Forms/First steps", "then", "left", "Nowhere"})
        .ExpectExit(1)
        .ExpectErrors(
            "tovimar: error: the contents have no 'Nowhere'\n"
            "  Name it by its titles (\"Forms/Orders\"), its page, or the number that \"tovimar contents "
            "--numbers\" shows.\n");
    EXPECT_EQ(ReadWhole(Folder() / "help/shop.tvp"), before);
    Run({"tree", "help", "skip", "Forms/Search"}).ExpectExit(0);
    EXPECT_THAT(Run({"tree", "help"}).ExpectExit(0).output,
                AllOf(HasSubstr("    1.1  Search       shop_Form_Search.htm  (left out)\n"),
                      HasSubstr("    3.1  Orders       shop_Form_Orders.htm\n"), Not(HasSubstr("#"))));
    Run({"tree", "help", "unskip", "Forms/Search"}).ExpectExit(0);
    Run({"tree", "help", "wiggle", "Forms"}).ExpectExit(2);
    Run({"tree", "help", "delete", "Forms/First steps", "--delete-page"}).ExpectExit(0);
    EXPECT_FALSE(fs::exists(Folder() / "help/First_steps.htm"));
    EXPECT_THAT(Contents(), Not(HasSubstr("First steps")));
}

TEST_F(TreeTest, AnEditRewritesWhatItChangesAndNoMore) {
    const auto project = [this] { return ReadWhole(Folder() / "help/shop.tvp"); };
    const auto icons = [](const std::string& file) {
        std::multiset<std::string> lines;
        std::istringstream in(file);
        for (std::string line; std::getline(in, line);)
            if (line.find("icon=") != std::string::npos ||
                line.find("PicsSubfolderName") != std::string::npos)
                lines.insert(line);
        return lines;
    };
    const auto made = icons(project());
    Run({"tree", "help", "up", "Forms/Search"}).ExpectExit(0);
    EXPECT_EQ(icons(project()), made);
    Run({"tree", "help", "down", "Forms/Search"}).ExpectExit(0);
    // What was moved once says since then where it came from.
    const auto before = project();
    EXPECT_EQ(icons(before), made);
    for (const char* steps : {"up", "cut"}) {
        Run({"tree", "help", steps, "Forms/Search", "then", "undo"}).ExpectExit(0);
        EXPECT_EQ(project(), before) << steps;
    }
    Run({"tree", "help", "move", "Forms/Search", "Tables", "then", "undo"}).ExpectExit(0);
    EXPECT_EQ(icons(project()), made);
    Run({"tree", "help", "copy", "Forms/Search", "then", "paste", "Tables"}).ExpectExit(0);
    auto copied = made;
    copied.insert("              icon=\"form\" \r");
    EXPECT_EQ(icons(project()), copied);
}

TEST_F(TreeTest, StepsBeforeAFailedOneLeaveNothing) {
    const auto files = [this] {
        std::map<fs::path, std::string> all;
        for (const auto& entry : fs::recursive_directory_iterator(Folder() / "help"))
            if (entry.is_regular_file() && entry.path().extension() != ".bak")
                all[entry.path()] = ReadWhole(entry.path());
        return all;
    };
    Write("mine.htm", "<html><body>Mine</body></html>");
    const auto before = files();
    for (const auto& step : std::vector<std::vector<std::string>>{{"delete", "Forms/Orders", "--delete-page"},
                                                                  {"index", "Forms/Orders", "Purchases"},
                                                                  {"new", "Forms", "First steps"},
                                                                  {"add", "Forms", "mine.htm"}}) {
        std::vector<std::string> words = {"tree", "help"};
        words.insert(words.end(), step.begin(), step.end());
        words.insert(words.end(), {"then", "up", "Nowhere"});
        Run(words).ExpectExit(1);
        EXPECT_EQ(files(), before) << step[0];
    }
}

TEST_F(TreeTest, IndexEntriesOfObjectsAndPages) {
    const auto index = [this](const std::string& node) {
        return Run({"tree", "help", "index", node}).ExpectExit(0).output;
    };
    const auto definition = [this] { return ReadWhole(Folder() / "help/xml/shop_Form_Orders.xml"); };
    const auto project = [this] { return ReadWhole(Folder() / "help/shop.tvp"); };
    Run({"tree", "help", "index", "Forms/Orders", "Orders"}).ExpectExit(0);
    const auto plain = project();
    fs::remove(Folder() / "help/z1_shop.tvp.bak");
    EXPECT_EQ(index("Forms/Orders"), "Orders\n");
    EXPECT_FALSE(fs::exists(Folder() / "help/z1_shop.tvp.bak")) << "a look needs no backup";
    Run({"tree", "help", "index", "Forms/Orders", "Purchases", "pur;chases", "Late \"ones\""}).ExpectExit(0);
    EXPECT_EQ(index("Forms/Orders"), "Purchases\nLate ones\n");
    EXPECT_THAT(definition(), HasSubstr("Purchases|Late ones"));
    EXPECT_EQ(project(), plain) << "an object's entries stand in its definition";
    Run({"tree", "help", "index", "Forms", "All windows"}).ExpectExit(0);
    EXPECT_EQ(index("Forms"), "All windows\n");
    EXPECT_THAT(project(), HasSubstr("All windows"));
    Run({"tree", "help", "index", "Forms", ";"})
        .ExpectExit(1)
        .ExpectErrors("tovimar: error: 'Forms' keeps its index entries: it needs one at least\n");
    Run({"recompile", "help"});
    EXPECT_THAT(ReadWhole(Folder() / "help/shop.hhk"),
                AllOf(HasSubstr("All windows"), HasSubstr("Purchases")));
}

TEST_F(TreeTest, AnotherApplicationIsRefused) {
    // A form that was left out from the start names no application.
    auto project = ReadWhole(Folder() / "help/shop.tvp");
    const std::string named = "  SourceProjectType = \"MS ACCESS\"  SourceProjectName = \"shop\"";
    ASSERT_NE(project.find(named), std::string::npos);
    Write("help/shop.tvp", project.erase(project.find(named), named.size()));
    Run({"regenerate", "help"}).ExpectExit(0);
    fs::rename(Folder() / "shop", Folder() / "store");
    Run({"regenerate", "help", "store"})
        .ExpectExit(1)
        .ExpectErrors("Reading store\ntovimar: error: the help was made from the application 'shop', and "
                      "this is 'store'; "
                      "nothing was written\n");
    EXPECT_EQ(ReadWhole(Folder() / "help/shop.tvp"), project);
    Run({"regenerate", "help"})
        .ExpectExit(1)
        .ExpectErrors(
            "tovimar: error: the application of the project isn't at '<FOLDER>/shop/shop.accdb' any "
            "more\n  SOURCE, behind the project, names its place.\n");
}

TEST_F(TreeTest, NewObjectsComeInAndEditedPagesStay) {
    const auto edited = ReadWhole(Folder() / "help/shop_Form_Orders.htm") + "<!-- mine -->";
    Write("help/shop_Form_Orders.htm", edited);
    Write("shop/forms/Customers.form", FormExport("Customers"));
    fs::remove(Folder() / "shop/forms/Search.form");
    const auto outcome = Run({"regenerate", "help"}).ExpectExit(0).output;
    EXPECT_THAT(outcome, AllOf(HasSubstr("New:           form \"Customers\" in shop_Form_Customers.htm\n"),
                               HasSubstr("Search"), HasSubstr("Kept: ")));
    EXPECT_EQ(ReadWhole(Folder() / "help/shop_Form_Orders.htm"), edited);
    EXPECT_TRUE(fs::exists(Folder() / "help/shop_Form_Search.htm"));
    EXPECT_THAT(ReadWhole(Folder() / "help/Forms.htm"), HasSubstr("shop_Form_Customers.htm"));
    EXPECT_THAT(Contents(), HasSubstr("shop_Form_Customers.htm"));
    // The list page's backup stays on the disk and out of what is shipped.
    EXPECT_THAT(ReadWhole(Folder() / "help/shop.hhp"),
                AllOf(HasSubstr("\r\nForms.htm\r\n"), Not(HasSubstr("\r\nForms_"))));
    const auto project = ReadWhole(Folder() / "help/shop.tvp");
    EXPECT_THAT(Run({"regenerate", "help"}).ExpectExit(0).output,
                HasSubstr("There are no new objects in the source project"));
    EXPECT_EQ(ReadWhole(Folder() / "help/shop.tvp"), project);
}

} // namespace
} // namespace tovimar::test
