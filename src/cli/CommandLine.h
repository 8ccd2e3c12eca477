#pragma once

#include <string>
#include <utility>
#include <vector>

namespace tovimar::cli {

/// Exit codes of the program.
enum ExitCode : int { kDone = 0, kFailed = 1, kUsage = 2, kInterrupted = 130 };

/// What the user asked for. Paths are native and as they were typed.
struct Arguments {
    enum class Command {
        None,
        New,
        Generate,
        Regenerate,
        Recompile,
        Screenshot,
        Open,
        ListProjects,
        ForgetProject,
        Contents,
        Tree,
        ListSettings,
        GetSetting,
        SetSetting,
        List,
        Options,
        ConvertContents,
        Inspect,
        ExportTexts
    };
    Command command = Command::None;
    /// The application; of `convert-contents` the contents file. May be empty where a project names it.
    std::string source;
    std::string output;
    std::string copyTo;
    /// As typed, and then taken apart: name as the option spells it, and value.
    std::vector<std::string> assignments;
    std::vector<std::pair<std::string, std::string>> options;
    /// Project file, its folder, or a name of the catalogue.
    std::string project;
    /// Of the command `screenshot`: the object, and what it is when the name alone doesn't tell.
    std::string object;
    enum class ObjectKind { Any, Form, Report };
    ObjectKind objectKind = ObjectKind::Any;
    bool topic = false;
    /// Of the command `open`: "help", "web" or "folder".
    std::string what = "help";
    std::string settingName;
    std::string settingValue;
    bool all = false;
    bool leftOut = false; ///< entries of the contents that the help doesn't have
    bool numbers = false; ///< of the entries of the contents
    /// Of the command `tree`: the operations, with "then" between them, and what becomes of a deleted page.
    std::vector<std::string> words;
    enum class Pages { Ask, Keep, Delete };
    Pages pages = Pages::Ask;
    bool open = false;
    bool compile = true;
    bool writeBack = false; ///< context ids go into the exports themselves
    bool verbose = false;
    bool json = false;
    bool yes = false; ///< questions answer themselves, as in a pipe
    /// Set when there is nothing to run: help and version were printed, or the line wasn't understood.
    bool ended = false;
    int exitCode = kDone;
};

/// Prints help, version or what is wrong with the line.
Arguments ParseCommandLine(int count, const char* const* arguments);

} // namespace tovimar::cli
