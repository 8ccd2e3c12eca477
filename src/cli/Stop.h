#pragma once

#include "cli/CommandLine.h"

#include <functional>
#include <string>

namespace tovimar::cli {

class Surroundings;

/// A reason to end the program with a message and an exit code.
struct Stop {
    std::string message;
    int exitCode = kFailed;
};

/// Raises `Stop` once the user has pressed Ctrl+C.
void StopIfInterrupted();
/// The absolute path of what was typed.
std::string FullPath(const std::string& native);
/// Prints a finished file's native path behind `what`; nothing for one that isn't there. A Windows path.
void ShowFile(const char* what, const std::string& path);
/// Runs a command's steps; a `Stop` that they raise is told and gives its exit code.
int RunToStop(Surroundings& surroundings, const std::function<int()>& steps);

} // namespace tovimar::cli
