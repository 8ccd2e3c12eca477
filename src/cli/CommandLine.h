#pragma once

#include <string>
#include <utility>
#include <vector>

namespace tovimar::cli {

/// Exit codes of the program.
enum ExitCode : int { kDone = 0, kFailed = 1, kUsage = 2, kInterrupted = 130 };

/// What the user asked for. Paths are native and as they were typed.
struct Arguments {
    enum class Command { None, Generate, Screenshot, List, Options };
    Command command = Command::None;
    std::string source;
    std::string output;
    std::string copyTo;
    /// Name as the option spells it, and value.
    std::vector<std::pair<std::string, std::string>> options;
    /// Of the command `screenshot`: project file or its folder, object, and what the object is when the name
    /// alone doesn't tell. Its `source` may be empty.
    std::string project;
    std::string object;
    enum class ObjectKind { Any, Form, Report };
    ObjectKind objectKind = ObjectKind::Any;
    bool topic = false;
    bool compile = true;
    bool writeBack = false; ///< context ids go into the exports themselves
    bool verbose = false;
    /// Set when there is nothing to run: help and version were printed, or the line wasn't understood.
    bool ended = false;
    int exitCode = kDone;
};

/// Prints help, version or what is wrong with the line.
Arguments ParseCommandLine(int count, const char* const* arguments);

} // namespace tovimar::cli
