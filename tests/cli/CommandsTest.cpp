#include "cli/Program.h"
#include "support/Golden.h"

#include <algorithm>
#include <array>
#include <csignal>
#include <nlohmann/json.hpp>

namespace tovimar::test {
namespace {

class CommandsTest : public ProgramTest {
protected:
    /// So many that the names alone fill any pipe.
    void WriteManyTables(int count) const {
        for (int i = 0; i < count; ++i) {
            const std::string name = "Table " + std::to_string(i) + " " + std::string(50, 'x');
            Write("many/tbldefs/" + name + ".sql", "CREATE TABLE [" + name + "] (\r\n  [Id] LONG\r\n)\r\n");
        }
    }
};

TEST_F(CommandsTest, WhatTheyShow) {
    struct Shown {
        const char* golden;
        std::vector<std::string> arguments;
    };
    const std::array<Shown, 18> all{{{"help.txt", {"--help"}},
                                     {"help-new.txt", {"new", "--help"}},
                                     {"help-generate.txt", {"generate", "--help"}},
                                     {"help-regenerate.txt", {"regenerate", "--help"}},
                                     {"help-tree.txt", {"tree", "--help"}},
                                     {"help-recompile.txt", {"recompile", "--help"}},
                                     {"help-screenshot.txt", {"screenshot", "--help"}},
                                     {"help-open.txt", {"open", "--help"}},
                                     {"help-projects.txt", {"projects", "--help"}},
                                     {"help-contents.txt", {"contents", "--help"}},
                                     {"help-settings.txt", {"settings", "--help"}},
                                     {"help-settings-set.txt", {"settings", "set", "--help"}},
                                     {"help-convert-contents.txt", {"convert-contents", "--help"}},
                                     {"help-inspect.txt", {"inspect", "--help"}},
                                     {"help-export.txt", {"export", "--help"}},
                                     {"version.txt", {"--version"}},
                                     {"options.txt", {"options"}},
                                     {"list.txt", {"list", kSample}}}};
    for (const Shown& shown : all)
        ExpectGolden(std::string("cli/commands/") + shown.golden,
                     Run(shown.arguments).ExpectExit(0).ExpectErrors("").output);
    for (const std::string& file : FilesBelow(TOVIMAR_SOURCE_DIR "/tests/golden/cli/commands"))
        EXPECT_TRUE(std::any_of(all.begin(), all.end(), [&](const Shown& one) { return one.golden == file; }))
            << "no test uses " << file;
}

TEST_F(CommandsTest, LinesThatAreNotUnderstood) {
    const std::string hint =
        "Run \"tovimar --help\" for the commands and \"tovimar COMMAND --help\" for their arguments.\n";
    const struct {
        std::vector<std::string> arguments;
        std::string errors;
    } cases[] = {
        {{}, "A subcommand is required\n" + hint},
        {{"frobnicate", "x"}, "there is no command 'frobnicate'\n" + hint},
        {{"projects", "frobnicate"}, "The following argument was not expected: frobnicate\n" + hint},
        {{"open", "help", "one", "two"}, "The following argument was not expected: two\n" + hint},
        {{"generate"}, "SOURCE is required\n" + hint},
        {{"generate", "nowhere"}, "SOURCE: Path does not exist: nowhere\n" + hint},
        {{"generate", kSample, "--option", "AddHotSpot=True"},
         "there is no option 'AddHotSpot'; did you mean AddHotSpots or AddHotSpotsForForm?\n  Run \"tovimar "
         "options\" for all of "
         "them.\n"},
        {{"generate", kSample, "--option", "Quux=1"},
         "there is no option 'Quux'\n  Run \"tovimar options\" for all of them.\n"},
        {{"generate", kSample, "--option", "AddHotSpots"}, "--option needs NAME=VALUE, not 'AddHotSpots'\n"},
        {{"generate", kSample, "--option", "AddHotSpots=perhaps"},
         "'perhaps' is no value of AddHotSpots, which takes true or false\n"},
        {{"generate", kSample, "--option", "HelpProjectName=../up"},
         "'../up' can't be the name of a file, as HelpProjectName needs it\n"},
    };
    for (const auto& wrong : cases)
        Run(wrong.arguments).ExpectExit(2).ExpectOutput("").ExpectErrors("tovimar: error: " + wrong.errors);
    EXPECT_EQ(FilesBelow(Folder()), (std::vector<std::string>{"user/errors.txt", "user/output.txt"}));
}

TEST_F(CommandsTest, ObjectsAsJson) {
    Write("app/forms/One.form", FormExport("The first"));
    Write("app/forms/Two.form", "Version =21\r\nBegin Form\r\n");
    const auto json = nlohmann::json::parse(Run({"list", "app", "--json"}).ExpectExit(1).output);
    EXPECT_EQ(json["name"], "app");
    ASSERT_EQ(json["objects"].size(), 2U);
    EXPECT_EQ(json["objects"][0], (nlohmann::json{{"kind", "form"},
                                                  {"name", "One"},
                                                  {"caption", "The first"},
                                                  {"nameOnly", false},
                                                  {"error", ""}}));
    EXPECT_NE(json["objects"][1]["error"], "");
}

TEST_F(CommandsTest, InAPipeARunIsQuiet) {
    Run({"generate", kSample, "--no-compile"})
        .ExpectExit(0)
        .ExpectErrors("Reading <SOURCE>/samples/orchard\nWriting help to <FOLDER>/orchard-help/\n");
}

TEST_F(CommandsTest, VerboseTellsEachObjectOnce) {
    Write("app/forms/One.form", FormExport("The first"));
    Write("app/tbldefs/Two.sql", "CREATE TABLE [Two] (\r\n  [A] LONG,\r\n  [B] LONG\r\n)\r\n");
    Run({"generate", "app", "--no-compile", "--verbose"})
        .ExpectExit(0)
        .ExpectErrors("Reading app\nWriting help to <FOLDER>/app-help/\nForms\nForm One\nReports\nTables\n"
                      "Table Two\nQueries\nMacros\nData model\nAbout this help\n");
}

TEST_F(CommandsTest, OnATerminalABarShowsTheObjectAndIsTakenAway) {
    Write("app/forms/One.form", FormExport("The first"));
    Started run = Start({"generate", "app", "--no-compile"}, Errors::Terminal);
    const std::string shown = run.ReadAll();
    EXPECT_EQ(run.Wait(), 0);
    EXPECT_NE(shown.find("] 3/13 Form One"), std::string::npos) << shown;
    EXPECT_EQ(shown.find('\n'), std::string::npos) << shown;
    EXPECT_TRUE(shown.ends_with("\r\033[K")) << shown;
}

TEST_F(CommandsTest, AnInterruptEndsARunAndTheNextOneSucceeds) {
    WriteManyTables(200);
    Started run = Start({"generate", "many", "--no-compile", "--verbose"}, Errors::Pipe);
    run.ReadUntil("Table Table");
    kill(run.process, SIGINT);
    const std::string rest = run.ReadAll();
    EXPECT_EQ(run.Wait(), 130);
    EXPECT_TRUE(rest.ends_with("tovimar: error: Help generation was cancelled by end-user.\n")) << rest;
    EXPECT_FALSE(fs::exists(Folder() / "many-help/many.tvp"));
    Run({"generate", "many", "--no-compile"}).ExpectExit(0);
}

} // namespace
} // namespace tovimar::test
