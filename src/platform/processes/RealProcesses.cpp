#include "platform/processes/RealProcesses.h"

#include "platform/Interrupt.h"
#include "platform/files/Paths.h"

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

extern char** environ; // NOLINT: the process's own

namespace tovimar::platform {
namespace {

constexpr std::size_t kMaxOutput = std::size_t{1} << 20;
/// How long a wait for output lasts before the child and the interrupt flag are looked at, in milliseconds.
constexpr int kPollInterval = 100;

/// A started program in a process group of its own, so that an interrupt reaches all that it started.
class Child {
public:
    explicit Child(const std::vector<std::string>& arguments) {
        std::array<int, 2> ends{};
        if (pipe2(ends.data(), O_CLOEXEC) != 0)
            throw RaisedError(kFailure1, std::string("No pipe: ") + std::strerror(errno), "Processes");
        output_ = ends[0];
        // Only our end: the program must be able to wait until we have read.
        fcntl(output_, F_SETFL, O_NONBLOCK);
        const int error = Spawn(arguments, ends[1]);
        close(ends[1]);
        if (error != 0) {
            close(output_);
            throw RaisedError(kFailure1, "'" + arguments[0] + "' can't be started: " + std::strerror(error),
                              "Processes");
        }
    }

    ~Child() {
        close(output_);
        if (!ended_)
            Kill();
    }

    Child(const Child&) = delete;
    Child& operator=(const Child&) = delete;

    /// Waits a little for output; false once the program has ended and all is read.
    bool Continue(std::string& output) {
        const bool hadEnded = ended_;
        pollfd wanted{output_, POLLIN, 0};
        const bool more = poll(&wanted, 1, hadEnded ? 0 : kPollInterval) > 0 && ReadSome(output);
        if (!ended_)
            CheckEnd();
        return more || !hadEnded;
    }

    int ExitCode() const { return WIFEXITED(status_) ? WEXITSTATUS(status_) : 128 + WTERMSIG(status_); }

    void Kill() {
        kill(-process_, SIGKILL);
        while (waitpid(process_, &status_, 0) < 0 && errno == EINTR)
            continue;
        ended_ = true;
    }

private:
    int Spawn(const std::vector<std::string>& arguments, int writeEnd) {
        posix_spawn_file_actions_t actions;
        posix_spawnattr_t attributes;
        posix_spawn_file_actions_init(&actions);
        posix_spawnattr_init(&attributes);
        posix_spawn_file_actions_addopen(&actions, 0, "/dev/null", O_RDONLY, 0);
        posix_spawn_file_actions_adddup2(&actions, writeEnd, 1);
        posix_spawn_file_actions_adddup2(&actions, writeEnd, 2);
        posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETPGROUP);
        posix_spawnattr_setpgroup(&attributes, 0);

        std::vector<char*> pointers;
        for (const auto& argument : arguments)
            pointers.push_back(const_cast<char*>(argument.c_str()));
        pointers.push_back(nullptr);
        const int error =
            posix_spawnp(&process_, pointers[0], &actions, &attributes, pointers.data(), environ);
        posix_spawnattr_destroy(&attributes);
        posix_spawn_file_actions_destroy(&actions);
        return error;
    }

    /// False at the end of the output.
    bool ReadSome(std::string& output) {
        std::array<char, 16384> buffer{};
        const ssize_t got = read(output_, buffer.data(), buffer.size());
        if (got <= 0) {
            // The program closed its output but may run on: nothing to poll for but its end.
            if (got == 0 && !ended_)
                usleep(1000);
            return got < 0 && (errno == EINTR);
        }
        const std::size_t room = kMaxOutput - std::min(kMaxOutput, output.size());
        output.append(buffer.data(), std::min(room, static_cast<std::size_t>(got)));
        return true;
    }

    void CheckEnd() {
        const pid_t result = waitpid(process_, &status_, WNOHANG);
        ended_ = result == process_ || (result < 0 && errno == ECHILD);
    }

    pid_t process_ = 0;
    int output_ = -1;
    int status_ = 0;
    bool ended_ = false;
};

bool LooksLikeWindowsPath(const std::string& text) {
    return HasDrive(text) && text.size() > 2 && text[2] == '\\';
}

} // namespace

std::vector<std::string> SplitCommandLine(const std::string& commandLine) {
    std::vector<std::string> parts;
    bool quoted = false;
    bool open = false;
    for (const char byte : commandLine) {
        if (byte == ' ' && !quoted) {
            open = false;
            continue;
        }
        if (!open) {
            parts.emplace_back();
            open = true;
        }
        if (byte == '"')
            quoted = !quoted;
        else
            parts.back() += byte;
    }
    return parts;
}

std::vector<std::string> RealProcesses::NativeArguments(const std::string& commandLine) {
    auto arguments = SplitCommandLine(commandLine);
    if (arguments.empty())
        throw RaisedError(kFailure1, "No program to start", "Processes");
    for (auto& argument : arguments)
        if (LooksLikeWindowsPath(argument))
            argument = files_.ToNative(argument);
    return arguments;
}

Processes::Outcome RealProcesses::RunAndWait(const std::string& commandLine) {
    const auto arguments = NativeArguments(commandLine);
    Child child(arguments);
    Outcome outcome;
    while (child.Continue(outcome.output)) {
        if (InterruptRequested()) {
            child.Kill();
            throw RaisedError(kGeneralFailure, "Stopped while '" + arguments[0] + "' was running",
                              "Processes");
        }
    }
    outcome.exitCode = child.ExitCode();
    return outcome;
}

bool RealProcesses::Open(const std::string& pathOrAddress) {
    const bool hasDesktop = getenv("DISPLAY") != nullptr || getenv("WAYLAND_DISPLAY") != nullptr;
    if (!hasDesktop || pathOrAddress.empty())
        return false;
    const bool isPath = LooksLikeWindowsPath(pathOrAddress);
    try {
        Child opener({"xdg-open", isPath ? files_.ToNative(pathOrAddress) : pathOrAddress});
        std::string ignored;
        while (opener.Continue(ignored))
            continue;
        return opener.ExitCode() == 0;
    } catch (const RaisedError&) {
        return false;
    }
}

} // namespace tovimar::platform
