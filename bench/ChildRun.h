#pragma once

#include <functional>
#include <string>
#include <vector>

/// Work in a process of its own, so that its processor time and memory are told apart from the measuring
/// program's.
namespace tovimar::bench {

struct ChildRun {
    double seconds = 0;          ///< of the wall clock
    double processorSeconds = 0; ///< of all threads
    double peakMegabytes = 0;
    int exitCode = -1; ///< -1 when it was killed
};

/// What `work` returns is the exit code. The caller must not have other threads.
ChildRun RunInChild(const std::function<int()>& work);

/// Starts a program, found through PATH, whose prints are dropped. Exit code 127: it isn't there.
ChildRun RunProgram(const std::vector<std::string>& words, const std::string& folder = ".");

} // namespace tovimar::bench
