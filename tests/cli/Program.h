#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <map>
#include <string>
#include <sys/types.h>
#include <vector>

/// Runs of the real program in a folder of their own.
namespace tovimar::test {

namespace fs = std::filesystem;

std::string ReadWhole(const fs::path& file);
/// Paths relative to the folder, "/" between their parts, sorted.
std::vector<std::string> FilesBelow(const fs::path& folder);

/// What a run that has ended left. Paths in its texts are replaced: "<FOLDER>" is the test's folder,
/// "<SOURCE>" that of the sources, "<VERSION>" version and date of the program.
class Outcome {
public:
    Outcome& ExpectExit(int code);
    /// All of standard error.
    Outcome& ExpectErrors(const std::string& text);
    /// All of standard output.
    Outcome& ExpectOutput(const std::string& text);
    Outcome& ExpectErrorsHold(const std::string& part);

    int exitCode = -1;
    std::string output;
    std::string errors;
};

/// The program started, its standard error at the reading end.
struct Started {
    pid_t process = 0;
    int errors = -1;
    /// Up to and including the first line that begins so, or all of it.
    std::string ReadUntil(const std::string& lineStart) const;
    std::string ReadAll() const { return ReadUntil({}); }
    /// Up to and including that text, which needn't end its line, or all of it.
    std::string ReadTo(const std::string& part) const;
    /// As if at the keyboard of a session's terminal: "\x03" is Ctrl+C, "\x04" the end of the input.
    void Type(const std::string& keys) const;
    /// Its exit code, 128 and the signal for a killed one.
    int Wait();
};

class ProgramTest : public ::testing::Test {
protected:
    ProgramTest();
    ~ProgramTest() override;

    /// The test's folder is the working folder, and holds the user's data and configuration.
    Outcome Run(const std::vector<std::string>& arguments);
    /// A session has its standard input on the terminal, too.
    enum class Errors { Pipe, Terminal, Session };
    Started Start(const std::vector<std::string>& arguments, Errors errors);

    const fs::path& Folder() const { return folder_; }
    void Write(const std::string& name, const std::string& bytes) const;
    /// From here on the command runs from a place that has no help compiler.
    void LeaveTheCompilerBehind();
    std::string WithPlaceholders(std::string text) const;
    /// A copy of the installation for tests that change it; its folder.
    fs::path OwnInstallation();

    std::string program = TOVIMAR_PROGRAM;
    /// PATH of the program; that of the test when it is empty.
    std::string searchPath;
    /// Further variables of the program's surroundings.
    std::map<std::string, std::string> variables;

private:
    [[noreturn]] void BecomeProgram(const std::vector<std::string>& arguments) const;
    pid_t Fork(const std::vector<std::string>& arguments, int output, int errors, bool session) const;
    fs::path folder_;
};

inline const std::string kSample = TOVIMAR_SOURCE_DIR "/samples/orchard";

/// Whether a program is found in the folders of PATH.
bool IsInstalled(const std::string& program);

/// A form as the host exports it; `controls` are the blocks of its detail section.
std::string FormExport(const std::string& caption, const std::string& controls = {});
/// `lines` go before the usual ones and replace them.
std::string ControlExport(const std::string& kind, const std::string& name, const std::string& lines = {});

} // namespace tovimar::test
