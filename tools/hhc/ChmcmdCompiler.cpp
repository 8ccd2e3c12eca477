#include "ChmcmdCompiler.h"

#include "Container.h"
#include "ProjectFile.h"

#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <string>
#include <sys/wait.h>
#include <unistd.h>

namespace hhc {
namespace fs = std::filesystem;
namespace {

volatile std::sig_atomic_t interrupted = 0;
volatile pid_t child = 0;

extern "C" void Interrupt(int) {
    interrupted = 1;
    if (child > 0)
        kill(child, SIGTERM);
}

void CatchSignals() {
    struct sigaction action {};
    action.sa_handler = Interrupt;
    sigaction(SIGINT, &action, nullptr);
    sigaction(SIGTERM, &action, nullptr);
    sigaction(SIGHUP, &action, nullptr);
}

/// A file that is gone when the program ends.
struct TemporaryFile {
    fs::path path;
    ~TemporaryFile() {
        std::error_code ignored;
        fs::remove(path, ignored);
    }
};

bool IsOnPath(const std::string& program) {
    const char* list = std::getenv("PATH");
    std::string paths = list == nullptr ? "/usr/bin:/bin" : list;
    for (std::size_t from = 0; from <= paths.size();) {
        const auto end = std::min(paths.find(':', from), paths.size());
        if (access((paths.substr(from, end - from) + "/" + program).c_str(), X_OK) == 0)
            return true;
        from = end + 1;
    }
    return false;
}

/// Runs `chmcmd` on the project in its folder; its exit code, 128 and more for one that was ended.
int RunCompiler(const fs::path& project) {
    const fs::path folder = project.parent_path();
    const std::string name = project.filename().string();
    child = fork();
    if (child == 0) {
        if (chdir(folder.c_str()) == 0)
            execlp("chmcmd", "chmcmd", name.c_str(), static_cast<char*>(nullptr));
        _exit(127);
    }
    if (child < 0)
        return 127;
    int status = 0;
    while (waitpid(child, &status, 0) < 0 && errno == EINTR)
        continue;
    child = 0;
    return WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
}

bool Read(const fs::path& path, std::string& bytes) {
    std::ifstream file(path, std::ios::binary);
    if (!file)
        return false;
    bytes.assign(std::istreambuf_iterator<char>(file), {});
    return true;
}

/// False when the finished file can't be written; it is replaced by a finished one or not at all.
bool Finish(const fs::path& compiled) {
    std::string bytes;
    if (!Read(compiled, bytes) || !SetRight(bytes))
        return false;
    const TemporaryFile copy{fs::path(compiled) += ".tmp"};
    if (!(std::ofstream(copy.path, std::ios::binary) << bytes << std::flush))
        return false;
    std::error_code error;
    fs::rename(copy.path, compiled, error);
    return !error;
}

} // namespace

int Fail(int code, const std::string& text) {
    std::fprintf(stderr, "hhc: error: %s\n", text.c_str());
    return code;
}

int CompileWithChmcmd(const fs::path& path) {
    std::string bytes;
    if (!Read(path, bytes))
        return Fail(2, "can't read the project '" + path.string() + "': " + std::strerror(errno));
    const TranslatedProject project = Translate(path, bytes);
    for (const std::string& name : project.missing)
        std::fprintf(stderr, "hhc: warning: '%s' is in the project but not on the disk\n", name.c_str());
    if (!project.hasFiles)
        return Fail(1, "'" + path.string() + "' lists no file that exists");
    if (!IsOnPath("chmcmd"))
        return Fail(2, "the compiler chmcmd isn't installed (Debian package fp-utils)");

    const TemporaryFile copy{path.parent_path() / ("~hhc" + std::to_string(getpid()) + ".hhp")};
    if (!(std::ofstream(copy.path, std::ios::binary) << project.text << std::flush))
        return Fail(1, "can't write '" + copy.path.string() + "': " + std::strerror(errno));
    CatchSignals();
    const int exitCode = RunCompiler(copy.path);
    std::error_code ignored;
    if (exitCode != 0 || interrupted != 0 || !fs::exists(project.compiledFile, ignored)) {
        // A compiler that breaks off leaves a file that looks compiled and holds nothing.
        fs::remove(project.compiledFile, ignored);
        if (interrupted != 0)
            return 130;
        return Fail(1, "'" + path.string() + "' was not compiled, chmcmd ended with " +
                           std::to_string(exitCode));
    }
    if (!Finish(project.compiledFile))
        return Fail(1, "can't finish '" + project.compiledFile.string() + "': " + std::strerror(errno));
    return project.missing.empty() ? 0 : 1;
}

} // namespace hhc
