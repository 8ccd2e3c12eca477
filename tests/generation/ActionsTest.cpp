#include "GenerationTest.h"

#include "generation/CTovimarActions.h"
#include "generation/CTovimarStats.h"
#include "platform/MessageBoxAnswers.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

namespace tovimar::test {
namespace {

class ActionsTest : public GenerationTest {
protected:
    GenerationRequest Request() { return {Path("help\\"), {}, {}, {}}; }
    std::string LastBox() const { return boxes->shown.empty() ? std::string() : boxes->shown.back().text; }

    CTovimarActions actions;
};

TEST_F(ActionsTest, SummaryTellsWhatTheKindOfSourceHas) {
    CTovimarStats stats;
    stats.HelpPagesQty = 12;
    stats.ControlSectionsQty = 30;
    stats.ScreenshotsQty = 4;
    stats.FormHelpContextIdsQty = 3;
    stats.HelpProvidersQty = 3;
    stats.IndexEntriesQty = 99;
    const std::string head =
        "The Tovimar added:\r\n12 new help pages with 42 sections,\r\n4 screenshots,\r\n";
    const std::string tail = "99 index entries in generated help.";
    const std::string forms = "3 updated helpcontextids in forms,\r\n";
    EXPECT_EQ(head + forms + tail, CTovimarActions::SummaryText(stats, "ms access")) << "no reports, no line";
    EXPECT_EQ(head + tail, CTovimarActions::SummaryText(stats, "ASP.NET"));
    EXPECT_EQ(head + "3 HelpProviders in forms,\r\n" + tail, CTovimarActions::SummaryText(stats, "C#"));
    stats.ReportHelpContextIdsQty = 1;
    EXPECT_EQ(head + forms + tail, CTovimarActions::SummaryText(stats, "VB6"));
    EXPECT_EQ(head + forms + "1 updated helpcontextids in reports,\r\n" + tail,
              CTovimarActions::SummaryText(stats, "MS ACCESS"));
}

TEST_F(ActionsTest, ProjectIsPreparedFromTheSource) {
    ASSERT_TRUE(actions.PrepareProject(Request()));
    EXPECT_EQ("Shop", Session::CurrentProject()->Name);
    EXPECT_EQ("", Session::CurrentProject()->TvpFullPath()) << "nothing is loaded from an earlier project";
    EXPECT_EQ("Shop", Parameters().ApplicationNameStr);
    EXPECT_EQ(kSuccess, actions.CheckIfGenerationPossible());

    answers["GetSourceProjectsList"] = "";
    EXPECT_FALSE(actions.PrepareProject(Request()));
    EXPECT_EQ("No Projects!", LastBox());
    answers["GetSourceProjectsList"] = "Other|Third";
    EXPECT_FALSE(actions.PrepareProject(Request()));
    EXPECT_EQ("Source project 'Shop' not found in the list of available source projects:\r\nOther|Third",
              LastBox());
}

TEST_F(ActionsTest, FolderOfAnotherApplicationIsRefused) {
    WriteFile("help\\Shop.tvp", "<TovimarProject><Project HUID=\"{H}\" SUID=\"{S}\">"
                                "<Form SourceProjectName=\"Library\"/></Project></TovimarProject>");
    ASSERT_TRUE(actions.PrepareProject(Request()));
    EXPECT_EQ(CTovimarActions::kOtherFolder, actions.CheckIfGenerationPossible());
    EXPECT_EQ("Target folder '" + Native(Path("help\\")) +
                  "'\r\nalready has Tovimar project 'Shop.tvp'.\r\n\r\nPlease select another target folder.",
              LastBox());
}

TEST_F(ActionsTest, ProjectOfTheSameSourceIsMadeAnewUnderItsIdentifiers) {
    WriteFile("help\\shop.tvp", "<TovimarProject><Project HUID=\"{H}\" SUID=\"{S}\">"
                                "<Form SourceProjectName=\"SHOP\"/></Project></TovimarProject>");
    ASSERT_TRUE(actions.PrepareProject(Request()));
    EXPECT_EQ("{H}", Session::CurrentProject()->HUID);
    EXPECT_EQ("{S}", Session::CurrentProject()->SUID);
    EXPECT_EQ(kSuccess, actions.CheckIfGenerationPossible());
    WriteFile("help\\Other.tvp", "<TovimarProject/>");
    EXPECT_EQ(CTovimarActions::kOtherFolder, actions.CheckIfGenerationPossible());
}

TEST_F(ActionsTest, FolderIsTestedBeforeAnythingIsWritten) {
    Parameters().SetFolderForGeneratedHelp(Path("50%#"));
    EXPECT_EQ(kSuccess, actions.CheckIfGenerationPossible()) << "the default answer goes on";
    EXPECT_EQ("Target folder '" + Native(Path("50%#\\")) +
                  "' contains character '%'\r\n"
                  "A help file (.chm) will not work correctly in folders with that character.\r\n"
                  "Do you want to select another target folder?",
              LastBox());
    boxes->answers = {platform::kAnswerYes};
    EXPECT_EQ(CTovimarActions::kOtherFolder, actions.CheckIfGenerationPossible());

    WriteFile("file", "");
    Parameters().SetFolderForGeneratedHelp(Path("file\\help"));
    EXPECT_EQ(CTovimarActions::kNoFolder, actions.CheckIfGenerationPossible());
    EXPECT_EQ("Target folder '" + Native(Path("file\\help\\")) +
                  "'\r\n cannot be created.\r\nPlease select or enter another target folder name.",
              LastBox());
}

TEST_F(ActionsTest, TestFileOfTheUserSurvivesTheWriteTest) {
    WriteFile("help\\test.txt", "mine");
    EXPECT_EQ(kSuccess, actions.CheckIfGenerationPossible());
    EXPECT_EQ("mine", HelpFile("test.txt"));
}

} // namespace
} // namespace tovimar::test
