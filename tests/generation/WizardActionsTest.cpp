#include "GenerationTest.h"

#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/LoadedForms.h"
#include "foundation/Paths.h"
#include "generation/CTovimarActions.h"
#include "generation/IHelpWizardForm.h"
#include "platform/MessageBoxAnswers.h"
#include "project/CHelpPrjTree.h"

namespace tovimar::test {
namespace {

/// Notes what it is told; its user has pressed Finish when `ok`.
class FakeWizard : public IHelpWizardForm {
public:
    explicit FakeWizard(std::vector<std::string>& calls, bool ok) : calls_(calls), ok_(ok) {}
    void Init() override { calls_.push_back("init"); }
    void Show() override { calls_.push_back("show"); }
    void Hide() override { calls_.push_back("hide"); }
    bool Visible() const override { return true; }
    bool OK() const override { return ok_; }
    void Terminate() override { calls_.push_back("terminate"); }

private:
    std::vector<std::string>& calls_;
    bool ok_;
};

class WizardActionsTest : public GenerationTest {
protected:
    using Calls = std::vector<std::string>;

    WizardActionsTest() {
        answers["AreThereAnySourceProjectsOpened"] = "True";
        answers["IDEDisplayModelIsMDI"] = "True";
        LoadSettings();
        Parameters().MakeNormalViewScreenshots = false;
        SetInstallation(Path("install\\"));
        for (const char* file :
             {"vasmoraWizardDef.xml", "CodePages.xml", "SampleFormDV.xml", "SampleFormDV.jpg"})
            WriteFile(std::string("install\\Settings\\") + file, "<x/>");
        server.Actions().MakeWizardForm = [this] {
            auto made = std::make_unique<FakeWizard>(calls, ok);
            wizard = made.get();
            return made;
        };
    }

    /// The wizard writes into this object.
    ~WizardActionsTest() override { server.CloseFormsOnDisconnection(); }

    void Open() {
        calls.clear();
        server.OpenNewProject();
    }
    /// Removes a file of the wizard and tells what the user is told.
    std::string TextWithout(const std::string& file) {
        const std::string path = Path("install\\Settings\\" + file);
        environment->files->DeleteFile(path);
        Open();
        WriteFile("install\\Settings\\" + file, "<x/>");
        std::string text = LastBox();
        const std::string quoted = "'" + Native(path) + "'";
        const auto at = text.find(quoted);
        return at == std::string::npos ? text : text.replace(at, quoted.size(), "'*'");
    }
    std::string LastBox() const { return boxes->shown.empty() ? std::string() : boxes->shown.back().text; }

    Calls calls;
    bool ok = true;
    FakeWizard* wizard = nullptr;
};

TEST_F(WizardActionsTest, OpensOnATemporaryProject) {
    answers["GetSourceProjectsList"] = "Shop|Stock";
    Open();
    EXPECT_EQ((Calls{"init", "show"}), calls) << LastBox();
    const auto* current = Session::CurrentProject();
    EXPECT_EQ("Shop", current->Name);
    EXPECT_TRUE(current->IsNew);
    EXPECT_TRUE(current->HasSeveralSourceProjects);
    EXPECT_EQ("Shop", Parameters().ApplicationNameStr);
    EXPECT_EQ("Shop", Parameters().HelpProjectTitle());
    Parameters().AddImageForForm = true;
    answers["CurrentSourceProjectTypeName"] = "asp.net";
    Open();
    EXPECT_EQ((Calls{"terminate", "init", "show"}), calls) << "the open one goes";
    EXPECT_FALSE(Parameters().AddImageForForm);

    server.Actions().MakeWizardForm = nullptr;
    Open();
    EXPECT_TRUE(calls.empty());
}

TEST_F(WizardActionsTest, TellsWhatIsMissing) {
    EXPECT_EQ("Wizard form definition file is missing '*'.", TextWithout("vasmoraWizardDef.xml"));
    EXPECT_EQ("Code pages definition file is missing '*'.", TextWithout("CodePages.xml"));
    EXPECT_EQ("Sample form definition file is missing '*'.", TextWithout("SampleFormDV.xml"));
    EXPECT_EQ("Sample form picture file is missing '*'.", TextWithout("SampleFormDV.jpg"));
    Parameters().MakeNormalViewScreenshots = true;
    Open();
    EXPECT_EQ("Sample form definition file is missing '" +
                  Native(Path("install\\Settings\\SampleFormNV.xml")) + "'.",
              LastBox());
    answers["GetSourceProjectsList"] = "";
    Open();
    EXPECT_EQ("No Projects!", LastBox());
    answers["AreThereAnySourceProjectsOpened"] = "";
    Open();
    EXPECT_EQ("Please open MS Access database or project before running Add-in.", LastBox());
    answers["CurrentSourceProjectTypeName"] = "MS EXCEL";
    answers["CurrentSourceProjectFullPath"] = "";
    Open();
    EXPECT_EQ("There is no any workbook opened or\r\nopened active workbook is not saved.", LastBox());
    answers["IDEDisplayModelIsMDI"] = "";
    Open();
    EXPECT_EQ("This version of Tovimar Add-In doesn't support SDI display model of host application IDE.\r\n"
              "Please switch to MDI display model.",
              LastBox());
    EXPECT_TRUE(calls.empty());
}

TEST_F(WizardActionsTest, CancelSavesAndLoadsNothing) {
    ok = false;
    Open();
    sent.clear();
    EXPECT_EQ(kSuccess, server.ProcessWizardFormClosing(*wizard));
    EXPECT_EQ((Calls{"init", "show", "hide", "terminate"}), calls);
    EXPECT_EQ(nullptr, Generator().HelpProjectTree().Root());
    EXPECT_TRUE(sent.empty());
    EXPECT_TRUE(boxes->shown.empty());
}

TEST_F(WizardActionsTest, WizardStaysWhereTheFolderIsTaken) {
    WriteFile("help\\Other.tvp", "<x/>");
    Open();
    EXPECT_EQ(CTovimarActions::kOtherFolder, server.ProcessWizardFormClosing(*wizard));
    EXPECT_EQ((Calls{"init", "show", "hide", "show"}), calls);
    EXPECT_EQ("Target folder '" + Native(Path("help\\")) +
                  "'\r\nalready has Tovimar project 'Other.tvp'.\r\n\r\nPlease select another target folder.",
              LastBox());
    EXPECT_EQ(1, Sent("ResetIDEWindows"));
    server.CloseFormsOnDisconnection();
    EXPECT_EQ("terminate", calls.back());
}

TEST_F(WizardActionsTest, FinishGeneratesAndAStoppedRunIsTold) {
    WriteFile("install\\Redirect\\Templates.rdt",
              environment->files->FromNative(SourceFolder() + "install/Templates") + "\\");
    WriteFile("install\\ss.exe", "");
    Open();
    Parameters().CompileHTMLHelp = false;
    Parameters().SetFolderForGeneratedHelp(Path("new help"));
    sent.clear();
    meter->lines.clear();
    EXPECT_EQ(kSuccess, server.ProcessWizardFormClosing(*wizard));
    EXPECT_EQ((Calls{"init", "show", "hide", "terminate"}), calls);
    ASSERT_EQ(1U, boxes->shown.size()) << LastBox();
    EXPECT_EQ("Help Generation Completed", boxes->shown[0].title);
    EXPECT_EQ(0U, LastBox().find("The Tovimar added:\r\n")) << LastBox();
    EXPECT_EQ(Path("new help\\"), Session::CurrentProject()->Folder);
    EXPECT_FALSE(Session::CurrentProject()->IsNew) << "listed and saved";
    EXPECT_TRUE(environment->files->FileExists(Path("new help\\Shop.tvp")));
    EXPECT_TRUE(environment->files->FileExists(UserSettingsFile()));
    EXPECT_EQ((Calls{"ResetIDEWindows"}), Calls(sent.end() - 1, sent.end()));

    Open();
    Parameters().SetFolderForGeneratedHelp(Path("third"));
    Generator().NodeStarted = [](const NodeProgress&) { Session::Run().generationInterrupted = true; };
    EXPECT_EQ(kSuccess, server.ProcessWizardFormClosing(*wizard));
    EXPECT_EQ("Help generation was cancelled by end-user.", LastBox());
    EXPECT_EQ("ResetIDEWindows", sent.back()) << "the host hears of it after the flag is cleared";
    EXPECT_FALSE(Session::Run().generationInterrupted);
}

TEST_F(WizardActionsTest, ReloadClosesAndOpensOnceLater) {
    Open();
    calls.clear();
    server.ReloadNewProject();
    server.ReloadNewProject();
    EXPECT_EQ(1U, timers->Running()) << "the second takes the place of the first";
    EXPECT_EQ(100, timers->lastInterval);
    EXPECT_TRUE(calls.empty());
    timers->Fire();
    EXPECT_EQ((Calls{"terminate", "init", "show"}), calls);
    timers->Fire();
    EXPECT_EQ(3U, calls.size());
}

} // namespace
} // namespace tovimar::test
