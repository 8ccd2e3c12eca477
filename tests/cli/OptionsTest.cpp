#include "cli/Program.h"

#include <gmock/gmock.h>

namespace tovimar::test {
namespace {

using ::testing::HasSubstr;
using ::testing::Not;

class OptionsTest : public ProgramTest {
protected:
    OptionsTest() {
        Write("shop/forms/Orders.form", FormExport("Order &Entry"));
        Write("shop/tbldefs/Goods.sql", "CREATE TABLE [Goods] (\r\n  [Id] LONG\r\n)\r\n");
    }
    std::string Page(const std::string& name) const { return ReadWhole(Folder() / "help" / name); }
};

TEST_F(OptionsTest, ReachPagesAndProject) {
    Run({"generate", "shop", "--output", "help", "--no-compile", "--option", "identifyby=name", "--option",
         "SnapshotFormat=Bitmap", "--option", "HelpProjectName=Manual", "--option", "Copyright=A=B",
         "--option", "GenerateHelpForTables=false"})
        .ExpectExit(0);
    const auto files = FilesBelow(Folder() / "help");
    EXPECT_THAT(files, ::testing::Contains("Manual.tvp"));
    EXPECT_THAT(files, ::testing::Contains(::testing::EndsWith("Form_Orders.bmp")));
    EXPECT_THAT(files, Not(::testing::Contains(HasSubstr("Goods"))));
    EXPECT_THAT(Page("Welcome.htm"), HasSubstr("A=B"));
    EXPECT_THAT(Page("Manual.tvp"), HasSubstr("Name = \"IdentifyBy\" Value = \"Name\""));
    EXPECT_THAT(Page("Manual.hhp"), HasSubstr("Compiled file = Manual.chm\r\n"));
}

TEST_F(OptionsTest, HoldForOneRun) {
    Run({"generate", "shop", "--output", "help", "--no-compile", "--option", "Copyright=Mine"}).ExpectExit(0);
    EXPECT_THAT(Page("Welcome.htm"), HasSubstr("Mine"));
    Run({"generate", "shop", "--output", "help", "--no-compile"}).ExpectExit(0);
    EXPECT_THAT(Page("Welcome.htm"), Not(HasSubstr("Mine")));
}

/// On a build server nothing but the folder is left of an earlier run.
TEST_F(OptionsTest, ProjectIsKnownAgainWithoutTheUsersCatalogue) {
    Run({"generate", "shop", "--output", "help", "--no-compile"}).ExpectExit(0);
    const std::string project = Page("shop.tvp");
    fs::remove_all(Folder() / "user");
    fs::create_directory(Folder() / "user");
    Run({"generate", "shop", "--output", "help", "--no-compile"}).ExpectExit(0);
    EXPECT_EQ(project, Page("shop.tvp")) << "identifiers included";
}

} // namespace
} // namespace tovimar::test
