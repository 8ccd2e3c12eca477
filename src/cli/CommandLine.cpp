#include "cli/CommandLine.h"

#include "cli/Console.h"
#include "cli/OptionValues.h"
#include "cli/Syntax.h"
#include "foundation/Product.h"

#include <CLI/CLI.hpp>

namespace tovimar::cli {
namespace {

constexpr const char* kExitCodes =
    "PROJECT is a project file (.tvp), a folder that holds one, or a name that \"tovimar projects\" shows.\n"
    "On a terminal questions are asked; in a pipe and with --yes their default answers are taken.\n\n"
    "Exit codes: 0 done, 1 something failed, 2 the command line wasn't understood, 130 stopped by the user.";

/// False when one of them isn't understood; says why.
bool TakeOptions(Arguments& parsed) {
    for (const std::string& assignment : parsed.assignments) {
        const OptionAssignment option = ParseOption(assignment);
        if (!option.complaint.empty()) {
            PrintError(option.complaint);
            return false;
        }
        parsed.options.emplace_back(option.name, option.value);
    }
    return true;
}

/// The name and the value are checked as those of `--option` are.
bool TakeSetting(Arguments& parsed) {
    const bool set = parsed.command == Arguments::Command::SetSetting;
    if (!set && parsed.command != Arguments::Command::GetSetting)
        return true;
    const OptionAssignment setting =
        set ? ParseOption(parsed.settingName, parsed.settingValue) : FindOption(parsed.settingName);
    parsed.settingName = setting.name;
    parsed.settingValue = setting.value;
    if (!setting.complaint.empty())
        PrintError(setting.complaint);
    return setting.complaint.empty();
}

/// The parser only says that a command is missing.
std::string Complaint(const CLI::App& app, const CLI::ParseError& error, int count,
                      const char* const* arguments) {
    if (count < 2 || arguments[1][0] == '-' || app.get_subcommands().size() > 0)
        return error.what();
    return "there is no command '" + std::string(arguments[1]) + "'";
}

Arguments Ended(int exitCode) {
    Arguments ended;
    ended.ended = true;
    ended.exitCode = exitCode;
    return ended;
}

} // namespace

Arguments ParseCommandLine(int count, const char* const* arguments) {
    Arguments parsed;
    CLI::App app("Tovimar writes the help of Access-style database applications.", "tovimar");
    app.set_version_flag("--version", std::string("tovimar ") + VersionText());
    app.require_subcommand(1);
    app.get_formatter()->label("REQUIRED", "");
    app.get_formatter()->label("SUBCOMMAND", "COMMAND");
    app.get_formatter()->label("Positionals", "Arguments");
    app.footer(kExitCodes);
    AddGenerationSyntax(app, parsed);
    AddProjectSyntax(app, parsed);
    AddSourceSyntax(app, parsed);
    try {
        app.parse(count, arguments);
    } catch (const CLI::ParseError& error) {
        if (error.get_exit_code() == static_cast<int>(CLI::ExitCodes::Success))
            return Ended(app.exit(error));
        PrintError(Complaint(app, error, count, arguments));
        PrintHint(
            "Run \"tovimar --help\" for the commands and \"tovimar COMMAND --help\" for their arguments.");
        return Ended(kUsage);
    }
    return TakeOptions(parsed) && TakeSetting(parsed) ? parsed : Ended(kUsage);
}

} // namespace tovimar::cli
