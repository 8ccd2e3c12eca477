#include "cli/Program.h"
#include "platform/text/Text.h"

#include <gmock/gmock.h>

#include <fcntl.h>
#include <sys/stat.h>

namespace tovimar::test {
namespace {

using ::testing::HasSubstr;
using ::testing::Not;

/// A help that exists: made again from its pages, and shown.
class RecompileTest : public ProgramTest {
protected:
    RecompileTest() { Write("shop/forms/Orders.form", FormExport("Order Entry")); }

    void Generate(const std::vector<std::string>& more = {"--no-compile"}) {
        std::vector<std::string> arguments{"generate", "shop", "--output", "help"};
        arguments.insert(arguments.end(), more.begin(), more.end());
        Run(arguments).ExpectExit(0);
    }
    /// All files were written long ago, but for the one.
    void Touch(const std::string& latest) const {
        for (const std::string& file : FilesBelow(Folder() / "help"))
            SetTime(file, file == latest ? 2'000'000 : 1'000'000);
    }
    std::string Page(const std::string& name) const { return ReadWhole(Folder() / "help" / name); }
    /// A viewer that notes what it was asked to show, in a line each.
    void UseViewer() {
        Write("bin/viewer", "#!/bin/sh\necho \"$@\" >>" + (Folder() / "shown.txt").string() + "\n");
        fs::permissions(Folder() / "bin/viewer", fs::perms::owner_all);
        variables["TOVIMAR_VIEWER"] = (Folder() / "bin/viewer").string() + " --show";
    }
    std::string Shown() const { return WithPlaceholders(ReadWhole(Folder() / "shown.txt")); }

private:
    void SetTime(const std::string& file, time_t seconds) const {
        const timespec times[2] = {{seconds, 0}, {seconds, 0}};
        EXPECT_EQ(utimensat(AT_FDCWD, (Folder() / "help" / file).c_str(), times, 0), 0);
    }
};

TEST_F(RecompileTest, ContentsFollowTheTreeAndPagesStay) {
    Generate();
    Write("help/shop_Form_Orders.htm",
          text::ReplaceAll(Page("shop_Form_Orders.htm"), "</body>", "<p>Mine</p></body>"));
    const std::string page = Page("shop_Form_Orders.htm");
    Write("help/shop.tvp",
          text::ReplaceAll(Page("shop.tvp"), "caption = \"Orders\"", "caption = \"All orders\""));
    Run({"recompile", "shop", "--no-compile"})
        .ExpectExit(0)
        .ExpectErrors("Reading <FOLDER>/shop\nWriting web help\n")
        .ExpectOutput("Web help:      <FOLDER>/help/main.htm\nProject:       <FOLDER>/help/shop.tvp\n");
    EXPECT_EQ(Page("shop_Form_Orders.htm"), page);
    EXPECT_THAT(Page("shop.hhc"), HasSubstr("All orders"));
    EXPECT_THAT(Page("shop.hhc"), Not(HasSubstr("value=\"Orders\"")));
    EXPECT_TRUE(fs::exists(Folder() / "help/z1_shop.tvp.bak"));
}

TEST_F(RecompileTest, CompilesAndCopies) {
    Generate();
    Run({"recompile", "help", "--copy-to", "copies"})
        .ExpectExit(0)
        .ExpectErrors("Reading <FOLDER>/shop\nCompiling help\n")
        .ExpectOutput(
            "Compiled help: <FOLDER>/help/shop.chm\n"
            "               <SIZE> MB, compiled in <TIME> seconds\nCopied to:     <FOLDER>/copies/shop.chm\n"
            "Web help:      <FOLDER>/help/main.htm\nProject:       <FOLDER>/help/shop.tvp\n");
    EXPECT_EQ(ReadWhole(Folder() / "copies/shop.chm"), Page("shop.chm"));
    Write("help/shop_Form_Orders.htm",
          text::ReplaceAll(Page("shop_Form_Orders.htm"), "</body>", "<a href=\"none.htm\">x</a></body>"));
    Run({"recompile", "help"})
        .ExpectExit(0)
        .ExpectErrorsHold("The help compiler has 1 warning; --verbose shows it.\n");
    Run({"recompile", "help", "--verbose"}).ExpectExit(0).ExpectErrorsHold("'none.htm' isn't on the disk");
    UseViewer();
    Run({"recompile", "help", "--open"}).ExpectExit(0);
    EXPECT_EQ(Shown(), "--show <FOLDER>/help/shop.chm\n");
    EXPECT_TRUE(fs::exists(Folder() / "shop/shop.chm"));
}

TEST_F(RecompileTest, WhatCanNotBe) {
    Run({"new", "shop", "--output", "help"}).ExpectExit(0);
    Run({"recompile", "help", "--no-compile"})
        .ExpectExit(1)
        .ExpectErrorsHold("tovimar: error: the help of '<FOLDER>/help/shop.tvp' wasn't generated yet\n"
                          "  \"tovimar generate\" writes its pages.\n");
    Generate();
    fs::rename(Folder() / "shop", Folder() / "moved");
    Run({"recompile", "help", "--no-compile"})
        .ExpectExit(1)
        .ExpectErrorsHold(
            "tovimar: error: the application of the project isn't at '<FOLDER>/shop/shop.accdb' any "
            "more\n  --source names its place.\n");
    Run({"recompile", "help", "--no-compile", "--source", "moved"}).ExpectExit(0);
    LeaveTheCompilerBehind();
    Run({"recompile", "help", "--source", "moved"})
        .ExpectExit(1)
        .ExpectErrorsHold("tovimar: error: the help compiler isn't installed; nothing was written\n");
}

TEST_F(RecompileTest, AProjectFromElsewhereIsKnownOnceItsSourceWasNamed) {
    Generate();
    fs::remove_all(Folder() / "user");
    fs::create_directory(Folder() / "user");
    Run({"recompile", "help", "--no-compile"})
        .ExpectExit(1)
        .ExpectErrors(
            "tovimar: error: it isn't known which application '<FOLDER>/help/shop.tvp' was made from\n"
            "  --source names its exports or its database.\n");
    Run({"recompile", "help", "--no-compile", "--source", "shop"}).ExpectExit(0);
    Run({"recompile", "shop", "--no-compile"}).ExpectExit(0);
}

TEST_F(RecompileTest, OpenShowsWhatIsThere) {
    Generate();
    Run({"open", "help", "help"})
        .ExpectExit(1)
        .ExpectErrors("tovimar: error: HTML Help doesn't exist '<FOLDER>/help/shop.chm'\n");
    Touch("main.htm");
    const std::string byHand =
        "No program shows it here; TOVIMAR_VIEWER may name one. To be opened by hand:\n";
    Run({"open", "web", "shop"}).ExpectExit(0).ExpectOutput("<FOLDER>/help/main.htm\n").ExpectErrors(byHand);
    UseViewer();
    Run({"open", "web"}).ExpectExit(0).ExpectOutput("").ExpectErrors("");
    Run({"open", "folder", "help/shop.tvp"}).ExpectExit(0);
    EXPECT_EQ(Shown(), "--show <FOLDER>/help/main.htm\n--show <FOLDER>/help/\n");
    variables["TOVIMAR_VIEWER"] = "false";
    Run({"open", "web"})
        .ExpectExit(0)
        .ExpectOutput("<FOLDER>/help/main.htm\n")
        .ExpectErrors("tovimar: warning: 'false' ended with the code 1\nTo be opened by hand:\n");
}

constexpr const char* kQuestion =
    "The help project has been changed since last generation or compilation.\n"
    "  Do you want to recompile contents and index of the Web Help before opening it ?\n";

TEST_F(RecompileTest, AStaleWebHelpIsRenewedInAPipe) {
    Generate();
    UseViewer();
    Touch("shop.tvp");
    Run({"open", "web", "help"})
        .ExpectExit(0)
        .ExpectErrors("Reading <FOLDER>/shop\ntovimar: warning: " + std::string(kQuestion) +
                      "  (answered by itself: yes)\n");
    EXPECT_EQ(Shown(), "--show <FOLDER>/help/main.htm\n");
    Run({"open", "web", "help"}).ExpectExit(0).ExpectErrors("");
}

TEST_F(RecompileTest, AStaleOneIsShownAsItIsWithoutItsApplication) {
    Generate();
    UseViewer();
    Touch("shop.tvp");
    fs::remove_all(Folder() / "shop");
    Run({"open", "web", "help"})
        .ExpectExit(0)
        .ExpectErrors("tovimar: warning: the help is older than the project and can't be renewed: the "
                      "application of the project isn't at '<FOLDER>/shop/shop.accdb' any more\n"
                      "  --source names its place.\n");
    EXPECT_EQ(Shown(), "--show <FOLDER>/help/main.htm\n");
}

TEST_F(RecompileTest, OnATerminalTheQuestionIsAsked) {
    Generate();
    UseViewer();
    Touch("shop.tvp");
    const auto mainPage = fs::last_write_time(Folder() / "help/main.htm");
    const auto ask = [&] {
        Started run = Start({"open", "web", "help"}, Errors::Session);
        EXPECT_THAT(run.ReadTo("[YES/no] "), HasSubstr("before opening it ?"));
        return run;
    };
    Started stopped = ask();
    stopped.Type("\x03");
    EXPECT_THAT(stopped.ReadAll(), HasSubstr("tovimar: error: interrupted\r\n"));
    EXPECT_EQ(stopped.Wait(), 130);
    EXPECT_FALSE(fs::exists(Folder() / "shown.txt"));

    Started ended = ask();
    ended.Type("\x04");
    ended.ReadAll();
    EXPECT_EQ(ended.Wait(), 130);

    Started declined = ask();
    declined.Type("maybe\n");
    EXPECT_THAT(declined.ReadTo("] "), HasSubstr("Please answer [YES/no]"));
    declined.Type("N\n");
    declined.ReadAll();
    EXPECT_EQ(declined.Wait(), 0);
    EXPECT_EQ(fs::last_write_time(Folder() / "help/main.htm"), mainPage);
    EXPECT_EQ(Shown(), "--show <FOLDER>/help/main.htm\n");

    Started accepted = ask();
    accepted.Type("\n");
    accepted.ReadAll();
    EXPECT_EQ(accepted.Wait(), 0);
    EXPECT_NE(fs::last_write_time(Folder() / "help/main.htm"), mainPage);
}

TEST_F(RecompileTest, QuestionsOfAGenerationAreAskedOnce) {
    const std::string folder = "50% off";
    Started run = Start({"generate", "shop", "--output", folder, "--no-compile"}, Errors::Session);
    run.ReadTo("[yes/NO] ");
    run.Type("\n");
    const std::string rest = run.ReadAll();
    EXPECT_EQ(run.Wait(), 0);
    EXPECT_THAT(rest, Not(HasSubstr("Do you want")));

    Started refused = Start({"generate", "shop", "--output", "100%", "--no-compile"}, Errors::Session);
    refused.ReadTo("[yes/NO] ");
    refused.Type("y\n");
    refused.ReadAll();
    EXPECT_EQ(refused.Wait(), 1);
    EXPECT_FALSE(fs::exists(Folder() / "100%"));

    // --yes takes the default answer, which isn't yes.
    Started unasked =
        Start({"generate", "shop", "--output", folder, "--no-compile", "--yes"}, Errors::Session);
    EXPECT_THAT(unasked.ReadAll(), HasSubstr("(answered by itself: no)"));
    EXPECT_EQ(unasked.Wait(), 0);
}

} // namespace
} // namespace tovimar::test
