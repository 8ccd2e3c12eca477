#include "ChildRun.h"

#include <chrono>
#include <cstdio>
#include <exception>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace tovimar::bench {
namespace {

double Seconds(const timeval& time) {
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
}

int Guarded(const std::function<int()>& work) {
    try {
        return work();
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "%s\n", failure.what());
        return 1;
    }
}

} // namespace

ChildRun RunInChild(const std::function<int()>& work) {
    const auto start = std::chrono::steady_clock::now();
    std::fflush(nullptr); // or the child prints again what waits
    const pid_t child = fork();
    if (child == 0)
        _exit(Guarded(work));
    int status = 0;
    rusage usage{};
    wait4(child, &status, 0, &usage);
    return {std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count(),
            Seconds(usage.ru_utime) + Seconds(usage.ru_stime), static_cast<double>(usage.ru_maxrss) / 1024,
            WIFEXITED(status) ? WEXITSTATUS(status) : -1};
}

ChildRun RunProgram(const std::vector<std::string>& words, const std::string& folder) {
    return RunInChild([&] {
        if (chdir(folder.c_str()) != 0 || std::freopen("/dev/null", "w", stdout) == nullptr ||
            std::freopen("/dev/null", "w", stderr) == nullptr)
            return 127;
        std::vector<char*> arguments;
        for (const std::string& word : words)
            arguments.push_back(const_cast<char*>(word.c_str()));
        arguments.push_back(nullptr);
        execvp(arguments[0], arguments.data());
        return 127;
    });
}

} // namespace tovimar::bench
