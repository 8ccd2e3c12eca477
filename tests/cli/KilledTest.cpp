#include "cli/Program.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <random>

namespace tovimar::test {
namespace {

/// The program killed in the middle of a change of a file, as a power cut or an impatient user would.
class KilledTest : public ProgramTest {
protected:
    KilledTest() {
#ifdef __SANITIZE_ADDRESS__
        variables["ASAN_OPTIONS"] = "verify_asan_link_order=0";
#endif
        Write("shop/forms/Main.form",
              FormExport("Start", ControlExport("CommandButton", "cmdGo", "Caption =\"&Go\"\r\n") +
                                      ControlExport("TextBox", "txtName")));
        Write("shop/forms/Orders.form", FormExport("Orders", ControlExport("TextBox", "txtNo")));
        Write("shop/tbldefs/Goods.sql", "CREATE TABLE [Goods] ([ID] AUTOINCREMENT, [Name] VARCHAR (50))");
        Run(generate).ExpectExit(0);
        // The second run has an earlier project to take over, as each run after a killed one has.
        Run(generate).ExpectExit(0);
        for (const std::string& file : FilesBelow(Folder() / "help"))
            whole_[file] = ReadWhole(Folder() / "help" / file);
    }

    long ChangesOf(const std::vector<std::string>& arguments) {
        const std::string file = (Folder() / "changes.txt").string();
        variables["LD_PRELOAD"] = TOVIMAR_KILLER;
        variables["TOVIMAR_COUNT_CHANGES"] = file;
        Run(arguments).ExpectExit(0);
        Undisturbed();
        return std::stol(ReadWhole(file));
    }
    void Kill(const std::vector<std::string>& arguments, long at) {
        variables["LD_PRELOAD"] = TOVIMAR_KILLER;
        variables["TOVIMAR_KILL_AT"] = std::to_string(at);
        // A file that is as it should be isn't always written, so a run may end before.
        const int ended = Run(arguments).exitCode;
        EXPECT_TRUE(ended == 128 + SIGKILL || ended == 0) << ended;
        Undisturbed();
    }
    void Undisturbed() {
        for (const char* name : {"LD_PRELOAD", "TOVIMAR_KILL_AT", "TOVIMAR_COUNT_CHANGES"})
            variables.erase(name);
    }

    void ExpectNothingLost() {
        Run({"contents", "help", "--json"}).ExpectExit(0).ExpectErrors("");
        const Outcome projects = Run({"projects", "--json"});
        EXPECT_EQ(projects.exitCode, 0);
        EXPECT_NE(projects.output.find("help/shop.tvp"), std::string::npos) << projects.output;
        for (const std::string& file : FilesBelow(Folder() / "help")) {
            const std::string bytes = ReadWhole(Folder() / "help" / file);
            if (text::EndsWithIgnoringCase(file, ".htm")) {
                EXPECT_NE(text::FindIgnoringCase(bytes, "</html>"), std::string::npos) << file;
            } else if (file.starts_with("xml/") && !IsTemporary(file)) {
                EXPECT_TRUE(XmlDocument().loadXML(bytes)) << file;
            } else if (file.starts_with("images/") && !IsTemporary(file)) {
                EXPECT_EQ(bytes, whole_[file]) << file;
            }
        }
    }
    static bool IsTemporary(const std::string& file) {
        return file.find(".tovimar-") != std::string::npos;
    }
    /// A run that isn't disturbed goes on from there and gives what it always gives, and nothing else.
    void ExpectWholeAgain() {
        Run(generate).ExpectExit(0);
        for (const std::string& file : FilesBelow(Folder() / "help"))
            EXPECT_TRUE(whole_.contains(file)) << file;
        for (const auto& [file, bytes] : whole_)
            EXPECT_EQ(ReadWhole(Folder() / "help" / file), bytes) << file;
    }
    void KillAtRandom(const std::vector<std::string>& arguments, int times) {
        std::uniform_int_distribution<long> at(1, ChangesOf(arguments));
        std::mt19937 random(20261123);
        for (int i = 0; i < times && !HasFailure(); ++i) {
            const long change = at(random);
            SCOPED_TRACE("killed at change " + std::to_string(change));
            Kill(arguments, change);
            ExpectNothingLost();
        }
    }

    const std::vector<std::string> generate{"generate", "shop", "--output", "help", "--no-compile"};

private:
    std::map<std::string, std::string> whole_;
};

TEST_F(KilledTest, InAGenerationAProjectStaysWhole) {
    KillAtRandom(generate, 120);
    ExpectWholeAgain();
}

TEST_F(KilledTest, WhileItIsMadeAgainAProjectStaysWhole) {
    KillAtRandom({"recompile", "help", "--no-compile"}, 50);
}

TEST_F(KilledTest, WhileAPictureIsRetakenAProjectStaysWhole) {
    KillAtRandom({"screenshot", "help", "Main", "--topic"}, 15);
}

TEST_F(KilledTest, WhileSettingsAreSavedTheyStayWhole) {
    const auto set = [](int i) {
        return std::vector<std::string>{"settings", "set", "Author", "Author " + std::to_string(i)};
    };
    std::uniform_int_distribution<long> at(1, ChangesOf(set(0)));
    std::mt19937 random(20261123);
    for (int i = 1; i <= 15; ++i) {
        Kill(set(i), at(random));
        EXPECT_EQ(Run({"settings", "get", "Author"}).ExpectExit(0).output.substr(0, 7), "Author ");
    }
}

} // namespace
} // namespace tovimar::test
