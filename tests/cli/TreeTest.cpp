#include "cli/HelpFolder.h"
#include "cli/Program.h"

#include <gmock/gmock.h>

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
    Run({"tree", "help", "wiggle", "Forms"}).ExpectExit(2);
    Run({"tree", "help", "delete", "Forms/First steps", "--delete-page"}).ExpectExit(0);
    EXPECT_FALSE(fs::exists(Folder() / "help/First_steps.htm"));
    EXPECT_THAT(Contents(), Not(HasSubstr("First steps")));
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
