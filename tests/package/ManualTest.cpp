#include "package/HelpTexts.h"
#include "platform/text/Text.h"

#include <gmock/gmock.h>

#include <map>

namespace tovimar::test {
namespace {

using ::testing::Contains;
using ::testing::HasSubstr;

/// What the manual's synopsis names for one command, in the words of the help.
struct Line {
    std::set<std::string> options;
    std::vector<std::string> arguments;
};

class ManualTest : public HelpTextsTest {
protected:
    const std::string manual = ReadWhole(TOVIMAR_SOURCE_DIR "/packaging/tovimar.1.in");

    std::string Section(const std::string& name) const {
        const auto start = manual.find(".Sh " + name + "\n");
        EXPECT_NE(start, std::string::npos) << name;
        return manual.substr(start, manual.find("\n.Sh ", start) - start);
    }
    std::map<std::string, Line> Synopsis() const {
        std::map<std::string, Line> lines;
        std::string command;
        for (std::string line : text::Split(Section("SYNOPSIS"), "\n")) {
            if (line == ".Nm")
                command.clear();
            else if (line.starts_with(".Cm "))
                command = line.substr(4);
            if (line.starts_with(".Op "))
                line = "." + line.substr(4);
            if (line.starts_with(".Fl "))
                lines[command].options.insert("-" + text::ReplaceAll(line.substr(4), " Ar ", " "));
            else if (line.starts_with(".Ar "))
                lines[command].arguments.push_back(line.substr(4));
            else if (line.starts_with(".Cm "))
                lines[command];
        }
        return lines;
    }
};

TEST_F(ManualTest, TheSynopsisIsThatOfTheProgram) {
    auto synopsis = Synopsis();
    for (CommandHelp& help : AllHelp()) {
        help.options.erase("--help");
        ASSERT_TRUE(synopsis.contains(help.command)) << "missing: " << help.command;
        EXPECT_EQ(synopsis[help.command].options, help.options) << help.command;
        EXPECT_EQ(synopsis[help.command].arguments, help.arguments) << help.command;
        synopsis.erase(help.command);
    }
    EXPECT_TRUE(synopsis.empty()) << "no command: " << synopsis.begin()->first;
}

TEST_F(ManualTest, EveryCommandAndOptionIsExplained) {
    const std::string commands = Section("COMMANDS");
    const auto options = text::Split(Section("OPTIONS"), "\n");
    for (const CommandHelp& help : AllHelp()) {
        const bool explained = help.command.empty() ||
                               commands.find(".It Cm " + help.command) != std::string::npos ||
                               commands.find(" , " + help.command + "\n") != std::string::npos;
        EXPECT_TRUE(explained) << help.command;
        for (const std::string& option : help.options) {
            const std::string words = text::ReplaceAll(option.substr(1), " ", " Ar ");
            EXPECT_THAT(options, Contains(option == "--help" ? ".It Fl h , Fl -help" : ".It Fl " + words));
        }
    }
}

TEST_F(ManualTest, IsSetWithoutComplaint) {
    if (!IsInstalled("man"))
        GTEST_SKIP() << "man of the package man-db isn't installed";
    const std::string said = (Folder() / "said.txt").string();
    const std::string command = "MANWIDTH=80 man --warnings -l '" TOVIMAR_BUILD_DIR
                                "/packaging/tovimar.1' >'" +
                                (Folder() / "page.txt").string() + "' 2>'" + said + "'";
    ASSERT_EQ(std::system(command.c_str()), 0) << ReadWhole(said);
    EXPECT_EQ(ReadWhole(said), "");
    EXPECT_THAT(ReadWhole(Folder() / "page.txt"), HasSubstr("convert-contents [--output FILE] FILE"));
}

} // namespace
} // namespace tovimar::test
