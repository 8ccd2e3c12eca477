#include "foundation/CTraceLog.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/FakeAccess.h"
#include "host/contract/IHelpPrjSourceProject.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/MessageBoxAnswers.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

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

} // namespace
} // namespace tovimar
