#include "package/HelpTexts.h"
#include "platform/text/Text.h"

#include <gmock/gmock.h>

#include <fstream>

namespace tovimar::test {
namespace {

using ::testing::ElementsAre;
using ::testing::UnorderedElementsAre;
using ::testing::UnorderedElementsAreArray;

class CompletionTest : public HelpTextsTest {
protected:
    CompletionTest() {
        // Beside it the completion must find the program as a user's shell does.
        std::ofstream(Folder() / "ask.sh")
            << "export PATH='" << fs::path(program).parent_path().string() << "':$PATH HOME='" << User()
            << "' XDG_DATA_HOME='" << User() << "' XDG_CONFIG_HOME='" << User()
            << "' TOVIMAR_INSTALL='" TOVIMAR_SOURCE_DIR "/install'\n"
            << "cd '" << Folder().string() << "'\n"
            << "source '" TOVIMAR_SOURCE_DIR "/packaging/completion/tovimar.bash'\n"
            << "COMP_WORDS=(tovimar \"$@\") COMP_CWORD=$#\n_tovimar\n"
            << "for word in \"${COMPREPLY[@]}\"; do echo \"$word\"; done\n";
    }

    /// What the shell offers for the last word; each is one as the shell breaks words.
    std::vector<std::string> Offered(const std::vector<std::string>& words) const {
        std::string command = "bash --norc '" + (Folder() / "ask.sh").string() + "'";
        for (const std::string& word : words)
            command += " '" + word + "'";
        const std::string result = (Folder() / "offered.txt").string();
        EXPECT_EQ(std::system((command + " >'" + result + "' 2>&1").c_str()), 0) << command;
        auto lines = text::Split(ReadWhole(result), "\n");
        lines.pop_back();
        return lines;
    }
    std::string User() const { return (Folder() / "user").string(); }
};

TEST_F(CompletionTest, OffersEveryCommandAndOption) {
    for (const CommandHelp& help : AllHelp()) {
        std::vector<std::string> words;
        if (!help.command.empty())
            words = text::Split(help.command, " ");
        words.push_back("-");
        EXPECT_THAT(Offered(words), UnorderedElementsAreArray(help.OptionNames())) << help.command;
        words.back() = "";
        if (help.commands.empty())
            continue;
        EXPECT_THAT(Offered(words), UnorderedElementsAreArray(help.commands)) << help.command;
    }
}

TEST_F(CompletionTest, OffersWhatAnArgumentMayBe) {
    fs::create_directory(Folder() / "A Folder");
    for (const char* name : {"An App.accdb", "Arch.MDB", "Afile.txt", "Ahelp.tvp", "Atoc.hhc"})
        Write(name, "");
    struct Case {
        std::vector<std::string> words;
        std::vector<std::string> offered;
    };
    const std::vector<Case> cases{
        {{"list", "A"}, {"A Folder", "An App.accdb", "Arch.MDB"}},
        {{"list", "An\\ "}, {"An App.accdb"}},
        {{"generate", "A"}, {"A Folder", "An App.accdb", "Arch.MDB", "Ahelp.tvp"}},
        {{"generate", "--output", "A"}, {"A Folder"}},
        {{"generate", "--output", "=", "A"}, {"A Folder"}},
        {{"recompile", "--verbose", "A"}, {"A Folder", "Ahelp.tvp"}},
        {{"convert-contents", "A"}, {"A Folder", "Atoc.hhc"}},
        {{"generate", "--option", "Snap"}, {"SnapshotFormat=", "SnapshotScale="}},
        {{"generate", "--option", "SnapshotFormat", "="}, {"Bitmap", "Jpeg"}},
        {{"generate", "--option", "SnapshotFormat", "=", "B"}, {"Bitmap"}},
        {{"settings", "set", "SnapshotF"}, {"SnapshotFormat"}},
        {{"settings", "set", "SnapshotFormat", ""}, {"Bitmap", "Jpeg"}},
        {{"settings", "--project", "Ah"}, {"Ahelp.tvp"}},
        {{"open", "w"}, {"web"}},
        {{"gen"}, {"generate"}},
        {{"nonsense", "A"}, {}},
    };
    for (const Case& one : cases)
        EXPECT_THAT(Offered(one.words), UnorderedElementsAreArray(one.offered)) << text::Join(one.words, " ");
}

TEST_F(CompletionTest, OffersProjectsOfTheCatalogue) {
    Run({"new", kSample, "--output", "help", "--option", "HelpProjectName=My Orchard"}).ExpectExit(0);
    EXPECT_THAT(Offered({"projects", "forget", ""}), ElementsAre("My\\ Orchard"));
    EXPECT_THAT(Offered({"open", "web", "My\\ O"}), ElementsAre("My\\ Orchard"));
    EXPECT_THAT(Offered({"open", ""}), UnorderedElementsAre("help", "web", "folder", "My\\ Orchard"));
}

TEST_F(CompletionTest, TheOtherShellsReadTheirScripts) {
    for (const auto& [shell, script] : std::map<std::string, std::string>{
             {"zsh", "_tovimar"}, {"fish", "tovimar.fish"}, {"bash", "tovimar.bash"}}) {
        if (!IsInstalled(shell))
            continue;
        const std::string command =
            shell + " -n '" TOVIMAR_SOURCE_DIR "/packaging/completion/" + script + "'";
        EXPECT_EQ(std::system(command.c_str()), 0) << command;
    }
}

} // namespace
} // namespace tovimar::test
