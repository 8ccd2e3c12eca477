#include "cli/CommandLine.h"

#include "cli/Console.h"
#include "cli/OptionValues.h"
#include "foundation/Product.h"

#include <CLI/CLI.hpp>

namespace tovimar::cli {
namespace {

constexpr const char* kSource =
    "folder of text exports, database file (.accdb, .mdb), or a folder that holds both";

void AddGenerate(CLI::App& app, Arguments& parsed, std::vector<std::string>& options, bool& noCompile) {
    auto* generate = app.add_subcommand("generate", "write the help of an application");
    generate->add_option("SOURCE", parsed.source, kSource)
        ->required()
        ->check(CLI::ExistingPath)
        ->type_name("");
    generate
        ->add_option("--output", parsed.output,
                     "folder of the help project; \"NAME-help\" here when not given")
        ->type_name("DIR");
    generate
        ->add_option("--option", options, "an option of the run, see \"tovimar options\"; may be repeated")
        ->type_name("NAME=VALUE")
        ->allow_extra_args(false)
        ->take_all();
    generate->add_flag("--no-compile", noCompile, "write project, pages and web help, run no compiler");
    generate
        ->add_option("--copy-to", parsed.copyTo,
                     "folder of the copy of the compiled help; beside SOURCE when not given")
        ->type_name("DIR");
    generate->add_flag("--write-back", parsed.writeBack,
                       "write new context ids into the exports of SOURCE; each changed one is kept as .bak");
    generate->add_flag("--verbose", parsed.verbose, "tell each object, warnings and the compiler's output");
    generate->callback([&] { parsed.command = Arguments::Command::Generate; });
}

void AddScreenshot(CLI::App& app, Arguments& parsed) {
    using Kind = Arguments::ObjectKind;
    auto* screenshot =
        app.add_subcommand("screenshot", "retake the pictures of one form or report of a help");
    screenshot->add_option("PROJECT", parsed.project, "project file (.tvp) of the help, or its folder")
        ->required()
        ->check(CLI::ExistingPath)
        ->type_name("");
    screenshot->add_option("OBJECT", parsed.object, "name of the form or report")->required()->type_name("");
    auto* form = screenshot->add_flag_callback(
        "--form", [&] { parsed.objectKind = Kind::Form; }, "the form, where a report has the same name");
    screenshot
        ->add_flag_callback(
            "--report", [&] { parsed.objectKind = Kind::Report; },
            "the report, where a form has the same name")
        ->excludes(form);
    screenshot->add_flag("--topic", parsed.topic, "write the topic anew too; the old one is kept beside it");
    screenshot
        ->add_option("--source", parsed.source,
                     "the application, where it isn't at the place that is remembered for the project")
        ->check(CLI::ExistingPath)
        ->type_name("SOURCE");
    screenshot->callback([&] { parsed.command = Arguments::Command::Screenshot; });
}

void AddList(CLI::App& app, Arguments& parsed) {
    auto* list = app.add_subcommand("list", "show the objects of an application by kind, with captions");
    list->add_option("SOURCE", parsed.source, kSource)->required()->check(CLI::ExistingPath)->type_name("");
    list->callback([&] { parsed.command = Arguments::Command::List; });
}

/// False when one of them isn't understood; says why.
bool TakeOptions(const std::vector<std::string>& given, Arguments& parsed) {
    for (const std::string& assignment : given) {
        const OptionAssignment option = ParseOption(assignment);
        if (!option.complaint.empty()) {
            PrintError(option.complaint);
            return false;
        }
        parsed.options.emplace_back(option.name, option.value);
    }
    return true;
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
    std::vector<std::string> options;
    bool noCompile = false;
    CLI::App app("Tovimar writes the help of Access-style database applications.", "tovimar");
    app.set_version_flag("--version", std::string("tovimar ") + VersionText());
    app.require_subcommand(1);
    AddGenerate(app, parsed, options, noCompile);
    AddScreenshot(app, parsed);
    AddList(app, parsed);
    app.add_subcommand("options", "show the options of a run with their defaults")->callback([&] {
        parsed.command = Arguments::Command::Options;
    });
    try {
        app.parse(count, arguments);
    } catch (const CLI::ParseError& error) {
        if (error.get_exit_code() == static_cast<int>(CLI::ExitCodes::Success))
            return Ended(app.exit(error));
        PrintError(error.what());
        PrintHint(
            "Run \"tovimar --help\" for the commands and \"tovimar COMMAND --help\" for their arguments.");
        return Ended(kUsage);
    }
    parsed.compile = !noCompile;
    return TakeOptions(options, parsed) ? parsed : Ended(kUsage);
}

} // namespace tovimar::cli
