#include "foundation/CAddInProject.h"
#include "foundation/Session.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "generation/CTovimarStats.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/access/AccessApplication.h"
#include "support/FakeEnvironment.h"

#include <algorithm>

/// What a run does about objects that fail and about being stopped, on an application that is read from its
/// exports.
namespace tovimar::test {
namespace {

class PassTest : public EnvironmentTest {
protected:
    PassTest() {
        SetInstallation(environment->folders.program);
        WriteFile("tools\\ss.exe", "");
        environment->folders.program = Path("");
    }

    void AddForm(const std::string& name) {
        WriteFile("app\\forms\\" + name + ".form",
                  "Version =20\r\nVersionRequired =20\r\nBegin Form\r\n"
                  "    Width =4000\r\n    Begin\r\n        Begin Section\r\n"
                  "            Height =2000\r\n            Name =\"Detail\"\r\n"
                  "        End\r\n    End\r\nEnd\r\n");
    }
    /// Cut off in its middle.
    void AddBrokenForm(const std::string& name) {
        WriteFile("app\\forms\\" + name + ".form",
                  "Version =20\r\nBegin Form\r\n    Width =4000\r\n    Begin\r\n");
    }

    CTovimarActions::Outcome Generate() {
        RegisterSettingsLoader();
        EXPECT_EQ(kSuccess,
                  client_.Connect(platform::access::OpenAccessApplication(NativeFolder() + "/app")));
        RunData().LoadSettings();
        auto& generator = RunData().Generator();
        generator.Parameters().CompileHTMLHelp = false;
        generator.NodeStarted = [this](const NodeProgress& node) {
            if (node.name == stopAt)
                Session::Run().generationInterrupted = true;
        };
        auto& actions = TheServer().Actions();
        EXPECT_TRUE(actions.PrepareProject({Path("help\\"), "App", {}, {}}));
        const auto outcome = actions.GenerateFromOptions();
        pages = RunData().GenerationStats().HelpPagesQty;
        return outcome;
    }
    bool Made(const std::string& file) { return environment->files->FileExists(Path("help\\" + file)); }
    long Errors() const {
        return std::count_if(boxes->shown.begin(), boxes->shown.end(),
                             [](const auto& box) { return box.title.starts_with("Error: "); });
    }
    std::string LastBox() const { return boxes->shown.empty() ? std::string() : boxes->shown.back().text; }

    CTovimarClient client_;
    std::string stopAt = "-";
    std::int32_t pages = 0;
};

TEST_F(PassTest, ObjectThatFailsIsReportedAndTheRestIsMade) {
    AddForm("Able");
    AddBrokenForm("Baker");
    AddForm("Charlie");
    EXPECT_EQ(CTovimarActions::Outcome::Completed, Generate());
    EXPECT_GT(Errors(), 0);
    EXPECT_EQ(Errors(), Session::Run().runErrorCount);
    for (const char* file : {"App_Form_Able.htm", "App_Form_Charlie.htm", "images\\App_Form_Charlie.jpg",
                             "App.tvp", "App.hhc", "App.hhp"})
        EXPECT_TRUE(Made(file)) << file;
    EXPECT_FALSE(Made("images\\App_Form_Baker.jpg"));
}

TEST_F(PassTest, FiftyErrorsStopTheRun) {
    for (int i = 100; i < 160; ++i)
        AddBrokenForm("F" + std::to_string(i));
    AddForm("Zulu");
    EXPECT_EQ(CTovimarActions::Outcome::Cancelled, Generate());
    EXPECT_GE(Errors(), kErrorLimit);
    EXPECT_LT(Errors(), 60);
    EXPECT_EQ("Help generation was cancelled by end-user.", LastBox());
    EXPECT_FALSE(Made("App_Form_Zulu.htm"));
    EXPECT_FALSE(Made("App.tvp"));
    EXPECT_FALSE(Session::Run().generationInterrupted);
}

TEST_F(PassTest, StoppedRunLeavesItsFolderToTheNextOne) {
    AddForm("Able");
    AddForm("Baker");
    stopAt = "Baker";
    EXPECT_EQ(CTovimarActions::Outcome::Cancelled, Generate());
    EXPECT_EQ("Help generation was cancelled by end-user.", LastBox());
    EXPECT_TRUE(Made("App_Form_Able.htm"));
    EXPECT_FALSE(Made("App_Form_Baker.htm"));
    EXPECT_EQ("end", meter->lines.back());

    client_.Disconnect();
    stopAt = "-";
    boxes->shown.clear();
    EXPECT_EQ(CTovimarActions::Outcome::Completed, Generate()) << LastBox();
    EXPECT_EQ(0, Errors()) << boxes->shown.front().text;
    EXPECT_TRUE(Made("App_Form_Baker.htm"));
    // A project that was saved is made anew under its identifiers.
    const std::string saved = ReadFile(Path("help\\App.tvp"));
    const auto identifiers = saved.substr(saved.find("SUID"), 100);
    client_.Disconnect();
    EXPECT_EQ(CTovimarActions::Outcome::Completed, Generate()) << LastBox();
    EXPECT_NE(std::string::npos, ReadFile(Path("help\\App.tvp")).find(identifiers));
}

} // namespace
} // namespace tovimar::test
