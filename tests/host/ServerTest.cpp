#include "foundation/CAddInProject.h"
#include "foundation/CTraceLog.h"
#include "foundation/LoadedForms.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/FakeAccess.h"
#include "host/contract/IHelpPrjSourceProject.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "host/server/IHelpEditorForm.h"
#include "platform/MessageBoxAnswers.h"
#include "project/CHelpPrjTree.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <utility>

namespace tovimar {
namespace {

class ServerTest : public test::EnvironmentTest {
protected:
    test::FakeAccess access;
};

TEST_F(ServerTest, ConnectionRegistersAndForgets) {
    CTovimarClient client;
    EXPECT_NE(client.Connect(nullptr), kSuccess);
    EXPECT_EQ(Session::Server(), nullptr);
    ASSERT_EQ(client.Connect(access.app), kSuccess);
    EXPECT_EQ(Session::Server(), &TheServer());
    ASSERT_NE(Session::Parameters(), nullptr);
    EXPECT_EQ(Session::Parameters()->NameOfFolderForGeneratedImagesWithSlash(), "images\\");
    EXPECT_EQ(Session::ServerData()->HostAppMainWindowHWnd(), 4711);
    EXPECT_EQ(Session::Context().CurrentSourceProjectFullPath(), "C:\\Data\\Orders.accdb");
    EXPECT_EQ(Session::Context().SourceProjectsList(), "Orders");
    EXPECT_EQ(Session::ServerData()->NewTovimarProjectName(), "Orders");
    EXPECT_EQ(TheServer().GetComponentFileNameWithPrefix(2, "Orders", "cmdOK"), "frmOrders_cmdOK");
    client.Disconnect();
    EXPECT_EQ(Session::Server(), nullptr);
    EXPECT_EQ(Session::ServerAgent(), nullptr);
    EXPECT_EQ(Session::Parameters(), nullptr);
    EXPECT_EQ(Session::Generator(), nullptr);
    ASSERT_NE(Session::TraceLog(), nullptr);
    client.Disconnect();
}

TEST_F(ServerTest, ProgressWindowOnlyWhileOpen) {
    CTovimarClient client;
    client.Connect(access.app);
    CTovimarServerData& data = *Session::ServerData();
    data.ProgressBarUpdate("early", 1);
    data.ProgressBarInit("Start", 3);
    data.ProgressBarUpdate("Next", 2);
    data.ProgressBarDispose();
    data.ProgressBarDispose();
    EXPECT_EQ(progress->lines, (std::vector<std::string>{"begin Start 3", "update Next 2", "end"}));
}

TEST_F(ServerTest, CompilerIsMissedOncePerConnection) {
    CTovimarClient client;
    client.Connect(access.app);
    boxes->answers = {platform::kAnswerCancel};
    EXPECT_EQ(TheServer().TestThatHtmlWorkshopInstalled(), platform::kAnswerCancel);
    EXPECT_EQ(TheServer().TestThatHtmlWorkshopInstalled(), 1);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].title, "Tovimar Add-In");
    EXPECT_FALSE(TheServer().HtmlWorkshopInstalled());
}

TEST_F(ServerTest, NoDatabaseIsAWarning) {
    access.project->With("FullName", "");
    CTovimarClient client;
    client.Connect(access.app);
    EXPECT_FALSE(Session::ServerData()->IsMSAccessDbOpened());
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].text, "Please open MS Access database or project before running Add-in.");
    EXPECT_EQ(Session::ServerAgent()->GetSourceProjectsList().Count(), 0U);
    EXPECT_EQ(Session::ServerAgent()->CurrentSourceProjectLocation(), "");
    EXPECT_EQ(Session::ServerAgent()->ParseSourceProject(), nullptr);
}

class FakeEditor : public IHelpEditorForm, public LoadedForm {
public:
    explicit FakeEditor(std::vector<std::string>& calls) : LoadedForm("frmHelpEditor"), calls_(calls) {}
    void Init() override { calls_.push_back("init"); }
    void OpenRootDocument() override { calls_.push_back("root"); }
    void Display() override { calls_.push_back("display"); }
    void SetFocusToHTMLEditor() override { calls_.push_back("edit"); }
    void SetVisible(bool visible) override { calls_.push_back(visible ? "visible" : "hidden"); }
    void SetFocus() override { calls_.push_back("focus"); }

private:
    std::vector<std::string>& calls_;
};

class FakeWizardWindow : public LoadedForm {
public:
    FakeWizardWindow() : LoadedForm("frmHelpWizard") {}
    void SetVisible(bool) override {}
    void SetFocus() override {}
};

TEST_F(ServerTest, WizardAndEditorNeverStandTogether) {
    CTovimarClient client;
    client.Connect(access.app);
    CTovimarServer& server = TheServer();
    std::vector<std::string> calls;
    server.MakeHelpEditorForm = [&] { return std::make_unique<FakeEditor>(calls); };
    const auto lastBox = [&] { return boxes->shown.empty() ? std::string() : boxes->shown.back().text; };
    {
        const FakeWizardWindow wizard;
        EXPECT_TRUE(server.IsFormLoaded("FRMHELPWIZARD"));
        server.OpenHelpEditorForm();
        EXPECT_EQ(lastBox(), "Please close Tovimar's Wizard form before opening Help Editor.");
        server.OpenProject();
        EXPECT_EQ(lastBox(), "Please close Tovimar's Wizard form before opening help project.");
        EXPECT_TRUE(calls.empty());
    }
    server.OpenHelpEditorForm();
    server.OpenNewProject();
    EXPECT_EQ(lastBox(), "Please close Tovimar's HTML Editor form before opening Wizard form.");
    server.OpenProject();
    EXPECT_EQ(lastBox(), "Please close Tovimar's HTML Editor form before opening help project.");
    server.OpenHelpProject();
    server.SetFocusToHTMLEditor();
    EXPECT_EQ(calls, (std::vector<std::string>{"init", "root", "display", "visible", "focus", "edit"}));
    EXPECT_EQ(boxes->shown.size(), 4U);
    for (const auto& box : boxes->shown)
        EXPECT_EQ(box.title, "Tovimar Add-In");
    client.Disconnect();
    EXPECT_EQ(Session::Forms().Find("frmHelpEditor"), nullptr);
}

TEST_F(ServerTest, ThreeStatesOfAProjectFileAreKept) {
    CTovimarServer server;
    const std::string file = WriteFile("Shop.tvp", "one");
    const auto kept = [&] {
        return ReadFile(Path("z1_Shop.tvp.bak")) + " " + ReadFile(Path("z2_Shop.tvp.bak")) + " " +
               ReadFile(Path("z3_Shop.tvp.bak"));
    };
    const std::pair<const char*, const char*> states[] = {
        {"one", "one one one"}, {"ONE", "one one one"},     {"two", "two one one"},
        {"two", "two one one"}, {"three", "three two one"}, {"four", "four three two"}};
    for (const auto& [text, expected] : states) {
        WriteFile("Shop.tvp", text);
        EXPECT_TRUE(server.BackUpHelpProjectFile(file));
        EXPECT_EQ(kept(), expected);
    }
    EXPECT_TRUE(server.BackUpHelpProjectFile(""));
    WriteFile("Shop.tvp", "five");
    std::filesystem::permissions(NativeFolder() + "/z1_Shop.tvp.bak", std::filesystem::perms::owner_read);
    EXPECT_FALSE(server.BackUpHelpProjectFile(file));
    EXPECT_NE(boxes->shown.back().text.find("CTovimarServer.BackUpHelpProjectFile"), std::string::npos);
}

TEST_F(ServerTest, ProjectFileIsLoadedWithItsPlaces) {
    CTovimarClient client;
    client.Connect(access.app);
    Session::ServerData()->LoadSettings();
    const std::string file = WriteFile(
        "help\\Shop.tvp", "<TovimarProject>\r\n<Project key=\"P\" Name=\"Shop\" Tag=\"Project\"/>\r\n"
                          "<Settings><Options/></Settings>\r\n</TovimarProject>");
    std::vector<std::string> calls;
    TheServer().MakeHelpEditorForm = [&] { return std::make_unique<FakeEditor>(calls); };
    ASSERT_EQ(TheServer().ReloadTovimarProject(file), kSuccess)
        << (boxes->shown.empty() ? "" : boxes->shown.back().text);
    EXPECT_EQ(progress->lines.front(), "begin Start project loading... 6");
    EXPECT_EQ(progress->lines.back(), "end");
    EXPECT_EQ(Session::CurrentProject()->TvpFullPath(), file);
    EXPECT_EQ(Session::Parameters()->FolderForGeneratedHelp(), Path("help\\"));
    ASSERT_NE(Session::HelpProjectTree()->Root(), nullptr);
    EXPECT_EQ(calls, (std::vector<std::string>{"init", "root", "display", "visible", "focus"}));
    EXPECT_TRUE(environment->files->FileExists(Path("help\\z3_Shop.tvp.bak")));

    std::filesystem::permissions(NativeFolder() + "/help/z1_Shop.tvp.bak",
                                 std::filesystem::perms::owner_read);
    WriteFile("help\\Shop.tvp", "<TovimarProject/>");
    EXPECT_NE(TheServer().ReloadTovimarProject(file), kSuccess);
    EXPECT_EQ(boxes->shown.back().text,
              "Errors detected while trying to make backup copy of Tovimar project file '" +
                  environment->files->ToNative(file) + "'.");
    EXPECT_EQ(Session::Forms().Find("frmHelpEditor"), nullptr) << "closed before";
}

} // namespace
} // namespace tovimar
