#pragma once

#include "cli/CommandLine.h"

#include <CLI/CLI.hpp>

#include <string>

/// Arguments that several commands share.
namespace tovimar::cli {

/// A command with its one line of help and an example line.
inline CLI::App* AddCommand(CLI::App& app, Arguments& parsed, const char* name, const char* help,
                            Arguments::Command command, const char* example) {
    auto* added = app.add_subcommand(name, help);
    // The words of a command within another one's come first.
    added->callback([&parsed, command] {
        if (parsed.command == Arguments::Command::None)
            parsed.command = command;
    });
    added->group("Commands");
    added->footer(std::string("Example: ") + example);
    return added;
}

/// The validator's own name says nothing to a user.
inline CLI::Validator Existing() {
    return CLI::Validator(CLI::ExistingPath).description("");
}

inline void AddSource(CLI::App& command, Arguments& parsed, const char* help) {
    command.add_option("SOURCE", parsed.source, help)->required()->check(Existing())->type_name("");
}

inline CLI::Option* AddProject(CLI::App& command, Arguments& parsed) {
    return command
        .add_option("PROJECT", parsed.project, "project file (.tvp), its folder, or a name of the catalogue")
        ->type_name("");
}

/// Where the application is, for a project that doesn't know it or knows another place.
inline void AddMovedSource(CLI::App& command, Arguments& parsed) {
    command
        .add_option("--source", parsed.source,
                    "the application, where it isn't at the place that is remembered for the project")
        ->check(Existing())
        ->type_name("SOURCE");
}

inline void AddYes(CLI::App& command, Arguments& parsed) {
    command.add_flag("--yes", parsed.yes, "ask nothing: take the default answer of every question");
}

inline void AddJson(CLI::App& command, Arguments& parsed) {
    command.add_flag("--json", parsed.json, "print JSON, for scripts");
}

} // namespace tovimar::cli
