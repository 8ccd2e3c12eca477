#include "GenerationTest.h"

#include "foundation/CTraceLog.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarCompiler.h"
#include "generation/OpenHelp.h"
#include "generation/clsHtmlHelp.h"
#include "generation/clsHtmlHelpForForm.h"
#include "platform/MessageBoxAnswers.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"

#include <filesystem>

namespace tovimar::test {
namespace {

class RecompileTest : public GenerationTest {
protected:
    RecompileTest() {
        answers["AreThereAnySourceProjectsOpened"] = "True";
        LoadSettings();
        Generator().HelpProjectTree().Load(
            {}, false, false, "<Project key=\"P\" Name=\"Shop\" GeneratedHtmlFile=\"Welcome.htm\"/>");
        project->PicsSubfolderName = "images";
        WriteFile("help\\Welcome.htm", "<html><body>Hello</body></html>");
        WriteFile("tools\\ss.exe", "");
        SetInstallation(environment->folders.program);
        environment->folders.program = Path("");
        // A compiler that makes the file that its project names.
        processes->run = [this](const std::string& commandLine) {
            if (commandLine.find("hhc.exe") != std::string::npos)
                WriteFile("help\\Shop.chm", "compiled");
            return platform::Processes::Outcome{0, "done"};
        };
    }

    void InstallCompiler() {
        WriteFile("tools\\hhc.exe", "");
        environment->registry->Write(
            "HKEY_LOCAL_MACHINE\\SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\App Paths\\hhw.exe", "",
            Path("tools\\hhw.exe"));
    }
    bool CompilerRan() const {
        return std::any_of(processes->commandLines.begin(), processes->commandLines.end(),
                           [](const auto& line) { return line.find("hhc.exe") != std::string::npos; });
    }
    /// Seconds since 1970.
    void SetFileTime(const std::string& name, int seconds) {
        namespace fs = std::filesystem;
        fs::last_write_time(Native(project->Folder + name),
                            fs::file_time_type(std::chrono::file_clock::from_sys(
                                std::chrono::sys_seconds(std::chrono::seconds(seconds)))));
    }
    std::string LastBox() const { return boxes->shown.empty() ? std::string() : boxes->shown.back().text; }
    std::string ProjectFile() { return Native(project->HHPFullPath()); }

    CTovimarCompiler compiler;
};

TEST_F(RecompileTest, MakesEverythingAgainAndOpensTheHelp) {
    InstallCompiler();
    boxes->answers = {platform::kAnswerYes};
    Session::Run().runErrorCount = 3;
    EXPECT_EQ(kSuccess, compiler.RecompileHelpProject());
    ASSERT_EQ(1U, boxes->shown.size()) << LastBox();
    EXPECT_EQ("Recompiling of the HTML help project\r\n\r\n'" + ProjectFile() +
                  "' succeeded.\r\n\r\nWould you like to open recompiled HTML help file?",
              LastBox());
    EXPECT_EQ("Tovimar Add-In", boxes->shown[0].title);
    EXPECT_EQ(
        (std::vector<std::string>{
            "begin Starting recompile... 6", "update Refreshing and saving control definitions... 1",
            "update Refreshing and saving TOC ... 2", "update Refreshing and saving HTML help index ... 3",
            "update Generating Java help... 3", "update Running HTML help compiler... 4",
            "update Copying recompiled HTML help... 5", "end"}),
        progress->lines);
    for (const char* file : {"Shop.tvp", "Shop.hhp", "Shop.txt", "Shop.hhc", "Shop.hhk", "main.htm"})
        EXPECT_TRUE(HelpFileExists(file)) << file;
    EXPECT_EQ("compiled", ReadFile(Path("Shop.chm"))) << "copied beside the source project";
    EXPECT_EQ((std::vector<std::string>{"1 " + project->CHMFullPath() + " ", "top 1"}), viewer->calls);
    EXPECT_EQ("done", Generator().CompilerOutput);

    // The window that shows the file is closed before it is compiled anew.
    EXPECT_EQ(kSuccess, compiler.RecompileHelpProject(/*vfSkipOpeningOfRecompiledHelp=*/true));
    EXPECT_EQ("close 1", viewer->calls.back());
    EXPECT_EQ(1U, boxes->shown.size()) << "nothing is asked";
}

TEST_F(RecompileTest, WithoutCompilationNothingIsAskedOrRun) {
    EXPECT_EQ(kSuccess, compiler.RecompileHelpProject(/*vfSkipOpeningOfRecompiledHelp=*/false,
                                                      /*vfSkipCHMCompilation=*/true));
    EXPECT_TRUE(HelpFileExists("Shop.hhc"));
    EXPECT_FALSE(CompilerRan());
    EXPECT_TRUE(boxes->shown.empty()) << LastBox();
}

TEST_F(RecompileTest, TellsWhatIsMissing) {
    compiler.RecompileHelpProject();
    EXPECT_EQ("HTML help workshop is not installed.", LastBox());
    EXPECT_EQ("end", progress->lines.back());
    InstallCompiler();
    projects.SetCurrentProject(nullptr);
    compiler.RecompileHelpProject();
    EXPECT_EQ("HTML help project was not generated.", LastBox());

    answers["AreThereAnySourceProjectsOpened"] = "False";
    EXPECT_EQ(kFailure1, compiler.RecompileHelpProject());
    EXPECT_EQ("Please open MS Access database or project before running Add-in.", LastBox());
    EXPECT_FALSE(CompilerRan());
}

TEST_F(RecompileTest, FailuresAreTold) {
    InstallCompiler();
    processes->run = [](const std::string& commandLine) -> platform::Processes::Outcome {
        if (commandLine.find("hhc.exe") != std::string::npos)
            throw RaisedError(5, "no such program");
        return {};
    };
    EXPECT_EQ(kSuccess, compiler.RecompileHelpProject());
    EXPECT_EQ(1, Session::Run().runErrorCount);
    const std::string line = Native(Path("tools\\hhc.exe")) + "\" \"" + ProjectFile() + "\"";
    EXPECT_NE(std::string::npos,
              LastBox().find("Cannot recompile help.\r\nPlease check that help file is closed and try "
                             "again.\r\n\r\nCommand line: \r\n\"" +
                             line + "\r\n\r\nReturn value: 5"))
        << LastBox();
    EXPECT_NE(std::string::npos, LastBox().find("CTovimarCompiler.RecompileHelpProject1")) << LastBox();

    // A step that was reported on the way makes the whole a failure, whatever the compiler did.
    processes->run = nullptr;
    environment->files->DeleteFile(project->Folder + "Shop.hhk");
    std::filesystem::create_directory(Native(project->Folder + "Shop.hhk"));
    compiler.RecompileHelpProject();
    EXPECT_EQ("Recompiling of the HTML help project\r\n\r\n'" + ProjectFile() + "' failed.", LastBox());
}

TEST_F(RecompileTest, HelpIsStaleWhenAFileIsLater) {
    const std::string help = project->CHMFullPath();
    EXPECT_FALSE(IsHelpStale(help)) << "no help";
    WriteFile("help\\Shop.chm", "");
    WriteFile("help\\Shop.tvp", "");
    WriteFile("help\\main.htm", "");
    WriteFile("help\\Shop.hhk", "");
    for (const char* file : {"Shop.chm", "Welcome.htm", "main.htm", "Shop.hhk"})
        SetFileTime(file, 1000);
    SetFileTime("Shop.tvp", 2000);
    EXPECT_FALSE(IsHelpStale(help)) << "every save touches the project file";
    EXPECT_TRUE(IsWebHelpStale(project->Folder + "main.htm"));
    SetFileTime("Shop.tvp", 1000);
    SetFileTime("Welcome.htm", 1001);
    EXPECT_TRUE(IsHelpStale(help));
    EXPECT_FALSE(IsWebHelpStale(project->Folder + "main.htm")) << "a page is no part of the frame";
    WriteFile("help\\A.CHM", "");
    SetFileTime("A.CHM", 1001);
    EXPECT_FALSE(IsHelpStale(help)) << "the first compiled help of the folder counts";
}

TEST_F(RecompileTest, OpeningHelp) {
    OpenHelp(false);
    EXPECT_EQ("HTML Help doesn't exist '" + Native(project->CHMFullPath()) + "'", LastBox());
    OpenWebHelp(false);
    EXPECT_EQ("Web Help entry HTML page doesn't exist '" + Native(project->Folder + "main.htm") + "'",
              LastBox());
    WriteFile("help\\Shop.chm", "");
    WriteFile("help\\main.htm", "");
    SetFileTime("Shop.chm", 1000);
    SetFileTime("main.htm", 1000);
    WriteFile("help\\Shop.hhc", "");

    boxes->answers = {platform::kAnswerNo, platform::kAnswerNo, platform::kAnswerYes};
    OpenHelp(false);
    EXPECT_EQ("The help project has been changed since last compilation.\r\n"
              "Do you want to recompile the HTML Help before opening it ?",
              LastBox());
    EXPECT_EQ("1 " + project->CHMFullPath() + " ", viewer->calls.at(0)) << "as it stands";
    OpenWebHelp(false);
    EXPECT_EQ("The help project has been changed since last generation or compilation.\r\n"
              "Do you want to recompile contents and index of the Web Help before opening it ?",
              LastBox());
    EXPECT_EQ(project->Folder + "main.htm", processes->opened.at(0));
    EXPECT_FALSE(HelpFileExists("Shop.hhp"));
    OpenWebHelp(false);
    EXPECT_TRUE(HelpFileExists("Shop.hhp")) << "made again";
    EXPECT_FALSE(CompilerRan());
    EXPECT_EQ(2U, processes->opened.size());

    const auto asked = boxes->shown.size();
    OpenHelp(true);
    EXPECT_EQ(asked, boxes->shown.size());
    projects.SetCurrentProject(nullptr);
    OpenHelp(true);
    EXPECT_EQ("HTML Help project was not yet generated and/or compiled.", LastBox());
}

TEST_F(RecompileTest, OpeningPartsOfTheProject) {
    const std::string file = project->HHPFullPath();
    const std::string index = project->HHKFullPath();
    server.OpenHelpProject();
    EXPECT_EQ("HTML help project doesn't exist '" + Native(file) + "'.", LastBox());
    server.OpenHelpProjectIndex();
    EXPECT_EQ("HTML help project index doesn't exist '" + Native(index) + "'.", LastBox());
    WriteFile("help\\Shop.hhp", "");
    WriteFile("help\\Shop.hhk", "");
    server.OpenHelpProject();
    server.OpenHelpProjectIndex();
    server.OpenHelpFolder();
    EXPECT_EQ((std::vector<std::string>{file, index, project->Folder}), processes->opened);

    project->Folder = Path("gone\\");
    server.OpenHelpFolder();
    EXPECT_EQ("HTML help project folder doesn't exist '" + Native(Path("gone\\")) + "'.", LastBox());
    projects.SetCurrentProject(nullptr);
    server.OpenHelpProject();
    EXPECT_EQ("HTML help project was not generated.", LastBox());
    server.OpenHelpFolder();
    EXPECT_EQ("HTML help project folder is empty.", LastBox());

    answers["HostAppMainWindowHWnd"] = "77";
    const std::string own = Path("vasmora.chm");
    server.OpenHelpTopics();
    EXPECT_EQ("Help doesn't exist '" + Native(own) + "'.", LastBox());
    WriteFile("vasmora.chm", "");
    server.OpenHelpTopics();
    server.OpenHelpIndex();
    server.OpenHelpSearch();
    EXPECT_EQ((std::vector<std::string>{"1 " + own + " ", "top 1", "2 " + own + " ", "top 2",
                                        "3 " + own + " ", "top 3"}),
              viewer->calls);
    std::int32_t owner = 0;
    server.Actions().ShowAboutForm = [&](std::int32_t window) { owner = window; };
    server.OpenAboutForm();
    EXPECT_EQ(77, owner);
}

TEST_F(RecompileTest, HelpWindowsOfCallers) {
    auto& help = server.ServerData()->HtmlHelp();
    help.SetFile("D:\\own.chm");
    help.OpenContext(7, {}, 100);
    help.OpenContext(0, "D:\\a.chm", 200);
    help.OpenIndex("D:\\a.chm", 100);
    viewer->canShow = false;
    help.OpenSearch();
    viewer->canShow = true;
    viewer->open.erase(3);
    help.CloseHelpWindows(100);
    help.OpenTopic("Welcome.htm");
    help.CloseAll();
    EXPECT_EQ((std::vector<std::string>{"15 D:\\own.chm 7", "top 1", "1 D:\\a.chm ", "top 2", "2 D:\\a.chm ",
                                        "top 3", "3 D:\\own.chm ", "close 1", "0 D:\\own.chm Welcome.htm",
                                        "top 4", "close 4", "close 2"}),
              viewer->calls);
}

TEST_F(RecompileTest, HelpOfAForm) {
    clsHtmlHelpForForm::Form form;
    form.hwnd = 55;
    form.HelpContextID = 12;
    clsHtmlHelpForForm help;
    help.Init(form, Path("own.chm"));
    EXPECT_TRUE(form.KeyPreview);
    std::int32_t key = 113;
    help.KeyDown(key);
    EXPECT_TRUE(viewer->calls.empty());
    key = 112;
    help.KeyDown(key);
    EXPECT_EQ(0, key) << "consumed";
    help.BeforeOpen = [](std::int32_t hwnd, const std::string&, std::int32_t& id, bool& cancel) {
        id += hwnd;
        cancel = id == 155;
    };
    help.HelpClick();
    form.HelpContextID = 100;
    help.HelpClick();
    help.OpenHelpEx(-1);
    help.QueryUnload(1);
    help.QueryUnload(0);
    help.Terminate();
    help.HelpClick();
    EXPECT_EQ((std::vector<std::string>{
                  "15 " + Path("own.chm") + " 12", "top 1", "15 " + Path("own.chm") + " 67", "top 2",
                  "15 " + Path("own.chm") + " 100", "top 3", "close 3", "close 2", "close 1"}),
              viewer->calls);
}

} // namespace
} // namespace tovimar::test
