#include "platform/Interrupt.h"
#include "platform/MessageBoxAnswers.h"
#include "platform/processes/RealProcesses.h"
#include "support/FakeEnvironment.h"

#include <csignal>
#include <sys/stat.h>

namespace tovimar::platform {
namespace {

class ProcessesTest : public test::EnvironmentTest {
protected:
    RealProcesses real{*environment->files};

    std::string Script(const std::string& name, const std::string& text) {
        const std::string path = WriteFile(name, "#!/bin/sh\n" + text);
        chmod(environment->files->ToNative(path).c_str(), 0755);
        return path;
    }
};

TEST(CommandLines, SplitOutsideOfQuotes) {
    EXPECT_EQ(SplitCommandLine("\"C:\\a b\\x.exe\"  -q \"C:\\c d\\\" \"\""),
              (std::vector<std::string>{"C:\\a b\\x.exe", "-q", "C:\\c d\\", ""}));
    EXPECT_TRUE(SplitCommandLine("  ").empty());
}

TEST_F(ProcessesTest, HandsOverNativePathsAndTakesTheOutput) {
    const std::string script = Script("my tool.sh", "echo \"$1|$2\"; echo failed >&2; exit 3\n");
    const auto outcome = real.RunAndWait("\"" + script + "\" \"" + Path("a b.hhp") + "\" plain");
    EXPECT_EQ(outcome.exitCode, 3);
    EXPECT_EQ(outcome.output, NativeFolder() + "/a b.hhp|plain\nfailed\n");
}

TEST_F(ProcessesTest, CutsEndlessOutput) {
    const auto outcome = real.RunAndWait("\"" + Script("noisy.sh", "head -c 3000000 /dev/zero\n") + "\"");
    EXPECT_EQ(outcome.output.size(), std::size_t{1} << 20);
    EXPECT_EQ(outcome.exitCode, 0);
}

TEST_F(ProcessesTest, SaysWhatCannotBeStarted) {
    try {
        real.RunAndWait("\"" + Path("none.exe") + "\"");
        FAIL();
    } catch (const RaisedError& error) {
        EXPECT_EQ(error.Number(), kFailure1);
        EXPECT_NE(std::string(error.what()).find(NativeFolder() + "/none.exe"), std::string::npos);
    }
    EXPECT_THROW(real.RunAndWait(""), RaisedError);
}

TEST_F(ProcessesTest, AnInterruptEndsTheProgram) {
    InstallInterruptHandler();
    // The child signals us once it runs, then would run for ever.
    const std::string script = Script("hang.sh", "kill -INT $PPID\nwhile :; do sleep 60; done\n");
    try {
        real.RunAndWait("\"" + script + "\"");
        FAIL();
    } catch (const RaisedError& error) {
        EXPECT_EQ(error.Number(), kGeneralFailure);
    }
    EXPECT_TRUE(InterruptRequested());
    ClearInterrupt();
    std::signal(SIGINT, SIG_DFL);
    std::signal(SIGTERM, SIG_DFL);
}

TEST(MessageBoxDefaults, FollowTheFlags) {
    const int expected[6][3] = {{1, 1, 1}, {1, 2, 1}, {3, 4, 5}, {6, 7, 2}, {6, 7, 6}, {4, 2, 4}};
    for (std::uint32_t buttons = 0; buttons < 6; ++buttons)
        for (std::uint32_t position = 0; position < 3; ++position)
            EXPECT_EQ(DefaultMessageBoxAnswer(buttons | position * 256 | 48), expected[buttons][position])
                << buttons << " " << position;
    EXPECT_EQ(DefaultMessageBoxAnswer(547), kAnswerCancel);
    EXPECT_EQ(DefaultMessageBoxAnswer(36), kAnswerYes);
    EXPECT_EQ(DefaultMessageBoxAnswer(7), kAnswerOk);
}

} // namespace
} // namespace tovimar::platform
