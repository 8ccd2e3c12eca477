#include "foundation/CAddInSettingsXmlFile.h"
#include "generation/CHelpPrjSelector.h"
#include "generation/GenerationTest.h"
#include "generation/frmOpenHelpProject.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

#include <sys/stat.h>

/// The help projects of a source: listed, chosen, taken over from elsewhere.
namespace tovimar::test {
namespace {

class HelpProjectChoiceTest : public GenerationTest {
protected:
    HelpProjectChoiceTest() {
        projects.SetCurrentProject(nullptr);
        Session::SetContext(server.ServerData());
    }

    /// Writes the project's file; its path.
    std::string ProjectFile(const std::string& name) {
        return WriteFile(name + "\\" + name + ".tvp", "<TovimarProject><Project Name=\"" + name +
                                                          "\" key=\"root\" title=\"Help of " + name +
                                                          "\" PicsSubfolderName=\"pics\"/></TovimarProject>");
    }
    std::string List(const std::string& name) {
        auto listed = std::make_unique<CAddInProject>();
        listed->Name = listed->FileName = name;
        listed->Folder = Path(name);
        listed->PicsSubfolderName = "pics";
        listed->SourceProjectFullPath = Path("Shop.accdb");
        listed->IsNew = false;
        const std::string path = ProjectFile(name);
        projects.Add(std::move(listed));
        return path;
    }
    std::string CurrentName() const {
        return projects.CurrentProject() == nullptr ? std::string() : projects.CurrentProject()->Name;
    }
};

TEST_F(HelpProjectChoiceTest, TheLatestProjectOfTheSourceIsTaken) {
    CHelpPrjSelector selector;
    EXPECT_EQ(selector.SetCurrent(), kGeneralFailure);
    EXPECT_TRUE(boxes->shown.empty());
    const std::string one = List("One");
    const std::string two = List("Two");
    EXPECT_EQ(selector.Init(), kSuccess);
    EXPECT_EQ(selector.ExistingProjects(), (std::vector<std::string>{two, one}));
    EXPECT_EQ(selector.SetCurrent(), kSuccess);
    EXPECT_EQ(CurrentName(), "Two");
    EXPECT_EQ(selector.SetCurrent(Path("none.tvp")), kGeneralFailure);
    EXPECT_EQ(boxes->shown.back().text, "Help project file doesn't exist: " + NativeFolder() + "/none.tvp");
    EXPECT_EQ(CurrentName(), "Two");
    selector.Terminate();
    EXPECT_EQ(selector.ExistingProjectsCount(), 0);
}

TEST_F(HelpProjectChoiceTest, AFileFromElsewhereIsListed) {
    List("One");
    const std::string path = ProjectFile("Foreign");
    EXPECT_EQ(CHelpPrjSelector().SetCurrent(path, /*vfLoadingExternalProject=*/true), kSuccess);
    const CAddInProject* foreign = projects.GetProjectDefinitionByTvpFullPath(path);
    ASSERT_NE(foreign, nullptr);
    EXPECT_EQ(projects.CurrentProject(), foreign);
    EXPECT_EQ(foreign->Name, "Foreign");
    EXPECT_EQ(foreign->Title(), "Help of Foreign");
    EXPECT_EQ(foreign->PicsSubfolderName, "pics");
    EXPECT_EQ(foreign->SourceProjectFullPath, Path("Shop.accdb"));
    EXPECT_EQ(foreign->SUID, projects.ExistingSUIDForGivenSourceProject(Path("Shop.accdb")));
    EXPECT_FALSE(foreign->HUID.empty());
    EXPECT_FALSE(foreign->IsNew);

    EXPECT_NE(CHelpPrjSelector().SetCurrent(WriteFile("broken.tvp", "<Tovimar"), true), kSuccess);
    EXPECT_EQ(projects.Count(), 2);
}

TEST_F(HelpProjectChoiceTest, TheOpenProjectIsSavedFirst) {
    const std::string one = List("One");
    const std::string two = List("Two");
    CHelpPrjSelector selector;
    ASSERT_EQ(selector.SetCurrent(one, false, /*vfSetHelpTreeObject=*/true), kSuccess);
    ASSERT_NE(Generator().HelpProjectTree().Root(), nullptr);
    Generator().HelpProjectTree().Root()->SetHtmlTitle("Edited");
    chmod((NativeFolder() + "/One/One.tvp").c_str(), 0444);
    EXPECT_EQ(selector.SetCurrent(two), kFailure2);
    EXPECT_EQ(CurrentName(), "One");
    EXPECT_EQ(Generator().HelpProjectTree().Root()->HtmlTitle(), "Edited");

    chmod((NativeFolder() + "/One/One.tvp").c_str(), 0644);
    EXPECT_EQ(selector.SetCurrent(two), kSuccess);
    EXPECT_EQ(CurrentName(), "Two");
    EXPECT_NE(ReadFile(one).find("title=\"Edited\""), std::string::npos) << ReadFile(one);
    EXPECT_EQ(Generator().HelpProjectTree().Root(), nullptr);
}

TEST_F(HelpProjectChoiceTest, TheDialogOffersProjectsAndMoreFiles) {
    const std::string one = List("One");
    frmOpenHelpProject dialog;
    EXPECT_EQ(dialog.lstProjectsList.entries, (std::vector<std::string>{one, "More Files..."}));
    dialog.ListClick(0);
    dialog.NewProjectClick();
    EXPECT_FALSE(dialog.lstProjectsList.enabled);
    EXPECT_EQ(dialog.lstProjectsList.SelectedEntry(), "");
    dialog.ExistingClick();
    dialog.ListDblClick(0);
    EXPECT_TRUE(dialog.Closed());
    EXPECT_EQ(dialog.ProjectDefFullPath(), one);
    EXPECT_EQ(CurrentName(), "One");

    frmOpenHelpProject chooser;
    chooser.Preload(1);
    EXPECT_FALSE(chooser.optExisting.visible || chooser.optNewProject.visible);
    EXPECT_TRUE(chooser.lstProjectsList.widened);
    chooser.ChooseFile = [&](const std::string& filter, const std::string&, std::uint32_t flags) {
        EXPECT_EQ(filter, "Tovimar Project (TVP)");
        EXPECT_EQ(flags, 28715U);
        return ProjectFile("Foreign") + std::string("\0rest", 5);
    };
    chooser.ListDblClick(1);
    EXPECT_TRUE(chooser.Closed());
    EXPECT_EQ(chooser.ProjectDefFullPath(), Path("Foreign\\Foreign.tvp"));

    frmOpenHelpProject fresh;
    fresh.NewProjectClick();
    fresh.OKClick();
    EXPECT_TRUE(fresh.Closed() && fresh.NewProjectChosen());
    EXPECT_EQ(fresh.ProjectDefFullPath(), "");
}

TEST_F(HelpProjectChoiceTest, TheDialogAsksAboutReadOnlyFiles) {
    List("One");
    WriteFile("One\\pics\\a.jpg", "");
    chmod((NativeFolder() + "/One/pics/a.jpg").c_str(), 0444);
    frmOpenHelpProject dialog;
    boxes->answers = {7, 6};
    dialog.ListDblClick(0);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].flags, 52U);
    EXPECT_EQ(
        boxes->shown[0].text,
        "Some of the files of selected Tovimar project \r\n\r\n" + NativeFolder() +
            "/One/One.tvp\r\n\r\nare read-only. Editing and saving of these files could result in errors."
            "\r\nAs a result of these errors you can loose your edits.\r\n\r\nWould you like to continue "
            "opening selected Tovimar project anyway ?");
    EXPECT_FALSE(dialog.Closed());
    dialog.OKClick();
    EXPECT_TRUE(dialog.Closed());
}

} // namespace
} // namespace tovimar::test
