#include "cli/Program.h"

#include "foundation/Product.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <fstream>
#include <pty.h>
#include <regex>
#include <sstream>
#include <sys/ioctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace tovimar::test {
namespace {

/// A page: the program waits for its reader early on.
constexpr int kPipeSize = 4096;

/// A program that asks what no test answers ends, and the test fails instead of waiting for ever.
constexpr unsigned kLongestRunSeconds = 300;

int OpenForWriting(const fs::path& file) {
    return open(file.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600);
}

} // namespace

std::string ReadWhole(const fs::path& file) {
    std::ifstream stream(file, std::ios::binary);
    std::ostringstream text;
    text << stream.rdbuf();
    return text.str();
}

std::vector<std::string> FilesBelow(const fs::path& folder) {
    std::vector<std::string> files;
    if (fs::exists(folder))
        for (const auto& entry : fs::recursive_directory_iterator(folder))
            if (!entry.is_directory())
                files.push_back(entry.path().lexically_relative(folder).generic_string());
    std::sort(files.begin(), files.end());
    return files;
}

Outcome& Outcome::ExpectExit(int code) {
    EXPECT_EQ(exitCode, code) << errors;
    return *this;
}
Outcome& Outcome::ExpectErrors(const std::string& text) {
    EXPECT_EQ(errors, text);
    return *this;
}
Outcome& Outcome::ExpectOutput(const std::string& text) {
    EXPECT_EQ(output, text);
    return *this;
}
Outcome& Outcome::ExpectErrorsHold(const std::string& part) {
    EXPECT_NE(errors.find(part), std::string::npos) << "not told: " << part << "\n" << errors;
    return *this;
}

std::string Started::ReadUntil(const std::string& lineStart) const {
    std::string text;
    std::size_t line = 0;
    char byte = 0;
    for (;;) {
        const ssize_t got = read(errors, &byte, 1);
        if (got < 0 && errno == EINTR)
            continue;
        if (got <= 0)
            return text;
        text += byte;
        if (byte != '\n')
            continue;
        if (!lineStart.empty() && text.compare(line, lineStart.size(), lineStart) == 0)
            return text;
        line = text.size();
    }
}

std::string Started::ReadTo(const std::string& part) const {
    std::string text;
    char byte = 0;
    while (text.find(part) == std::string::npos) {
        const ssize_t got = read(errors, &byte, 1);
        if (got < 0 && errno == EINTR)
            continue;
        if (got <= 0)
            break;
        text += byte;
    }
    return text;
}

void Started::Type(const std::string& keys) const {
    EXPECT_EQ(write(errors, keys.data(), keys.size()), static_cast<ssize_t>(keys.size()));
}

int Started::Wait() {
    int status = 0;
    while (waitpid(process, &status, 0) < 0 && errno == EINTR)
        continue;
    close(errors);
    return WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
}

ProgramTest::ProgramTest() {
    std::string pattern = (fs::temp_directory_path() / "tovimar-run-XXXXXX").string();
    if (mkdtemp(pattern.data()) == nullptr)
        throw std::runtime_error("no folder for the test can be made: " + pattern);
    folder_ = fs::canonical(pattern);
    fs::create_directories(folder_ / "user");
}

ProgramTest::~ProgramTest() {
    std::error_code ignored;
    fs::remove_all(folder_, ignored);
}

void ProgramTest::BecomeProgram(const std::vector<std::string>& arguments) const {
    const std::string user = (folder_ / "user").string();
    for (const char* name : {"HOME", "XDG_DATA_HOME", "XDG_CONFIG_HOME", "TMPDIR"})
        setenv(name, user.c_str(), 1);
    setenv("TOVIMAR_INSTALL", TOVIMAR_SOURCE_DIR "/install", 1);
    if (!searchPath.empty())
        setenv("PATH", searchPath.c_str(), 1);
    for (const char* desktop : {"DISPLAY", "WAYLAND_DISPLAY", "TOVIMAR_VIEWER"})
        unsetenv(desktop);
    for (const auto& [name, value] : variables)
        setenv(name.c_str(), value.c_str(), 1);
    std::vector<char*> pointers{const_cast<char*>(program.c_str())};
    for (const std::string& argument : arguments)
        pointers.push_back(const_cast<char*>(argument.c_str()));
    pointers.push_back(nullptr);
    alarm(kLongestRunSeconds);
    if (chdir(folder_.c_str()) == 0)
        execv(pointers[0], pointers.data());
    _exit(127);
}

pid_t ProgramTest::Fork(const std::vector<std::string>& arguments, int output, int errors,
                        bool session) const {
    const pid_t process = fork();
    if (process != 0)
        return process;
    const int input = session ? errors : open("/dev/null", O_RDONLY | O_CLOEXEC);
    if (session) {
        setsid();
        ioctl(errors, TIOCSCTTY, 0);
    }
    dup2(input, STDIN_FILENO);
    dup2(output, STDOUT_FILENO);
    dup2(errors, STDERR_FILENO);
    BecomeProgram(arguments);
}

Outcome ProgramTest::Run(const std::vector<std::string>& arguments) {
    const int output = OpenForWriting(folder_ / "user/output.txt");
    const int errors = OpenForWriting(folder_ / "user/errors.txt");
    Started run{Fork(arguments, output, errors, /*session=*/false), errors};
    close(output);
    Outcome outcome;
    outcome.exitCode = run.Wait();
    outcome.output = WithPlaceholders(ReadWhole(folder_ / "user/output.txt"));
    outcome.errors = WithPlaceholders(ReadWhole(folder_ / "user/errors.txt"));
    return outcome;
}

Started ProgramTest::Start(const std::vector<std::string>& arguments, Errors errors) {
    std::array<int, 2> ends{-1, -1};
    if (errors != Errors::Pipe) {
        winsize size{24, 100, 0, 0};
        EXPECT_EQ(openpty(&ends[0], &ends[1], nullptr, nullptr, &size), 0);
        fcntl(ends[0], F_SETFD, FD_CLOEXEC);
    } else {
        EXPECT_EQ(pipe2(ends.data(), O_CLOEXEC), 0);
        fcntl(ends[1], F_SETPIPE_SZ, kPipeSize);
    }
    const int output = OpenForWriting(folder_ / "user/output.txt");
    const Started run{Fork(arguments, output, ends[1], errors == Errors::Session), ends[0]};
    close(output);
    close(ends[1]);
    return run;
}

void ProgramTest::LeaveTheCompilerBehind() {
    fs::copy_file(program, folder_ / "user/alone");
    program = (folder_ / "user/alone").string();
    variables["TOVIMAR_INSTALL"] = TOVIMAR_SOURCE_DIR "/install";
}

void ProgramTest::Write(const std::string& name, const std::string& bytes) const {
    const fs::path file = folder_ / name;
    fs::create_directories(file.parent_path());
    std::ofstream(file, std::ios::binary) << bytes;
}

fs::path ProgramTest::OwnInstallation() {
    const fs::path install = folder_ / "user/install";
    fs::copy(TOVIMAR_SOURCE_DIR "/install", install, fs::copy_options::recursive);
    variables["TOVIMAR_INSTALL"] = install.string();
    return install;
}

std::string ProgramTest::WithPlaceholders(std::string text) const {
    text = text::ReplaceAll(text, folder_.string(), "<FOLDER>");
    text = text::ReplaceAll(text, TOVIMAR_SOURCE_DIR, "<SOURCE>");
    static const std::regex kMeasured("[0-9.]+ MB, compiled in [0-9.]+ seconds");
    text = std::regex_replace(text, kMeasured, "<SIZE> MB, compiled in <TIME> seconds");
    return text::ReplaceAll(text, VersionText(), "<VERSION>");
}

bool IsInstalled(const std::string& program) {
    const char* list = std::getenv("PATH");
    const auto folders = text::Split(list == nullptr ? "/usr/bin" : list, ":");
    return std::any_of(folders.begin(), folders.end(), [&](const std::string& folder) {
        return access((folder + "/" + program).c_str(), X_OK) == 0;
    });
}

std::string FormExport(const std::string& caption, const std::string& controls) {
    return "Version =21\r\nVersionRequired =20\r\nBegin Form\r\n    Caption =\"" + caption +
           "\"\r\n    Width =5000\r\n    Begin\r\n        Begin Section\r\n            Height =3000\r\n"
           "            Name =\"Detail\"\r\n            Begin\r\n" +
           controls + "            End\r\n        End\r\n    End\r\nEnd\r\n";
}

std::string ControlExport(const std::string& kind, const std::string& name, const std::string& lines) {
    return "                Begin " + kind + "\r\n" + lines +
           "                    Left =100\r\n                    Top =100\r\n"
           "                    Width =2000\r\n                    Height =1500\r\n"
           "                    Name =\"" +
           name + "\"\r\n                End\r\n";
}

} // namespace tovimar::test
