#include "cli/Syntax.h"
#include "cli/SyntaxWords.h"

namespace tovimar::cli {
namespace {

using Command = Arguments::Command;

constexpr const char* kSource =
    "folder of text exports, database file (.accdb, .mdb), or a folder that holds both";
constexpr const char* kSourceOrProject = "folder of text exports, database file (.accdb, .mdb), a folder "
                                         "that holds both, or a project file (.tvp) "
                                         "that is made anew with its own options";

void AddOutput(CLI::App& command, Arguments& parsed) {
    command
        .add_option("--output", parsed.output,
                    "folder of the help project; \"NAME-help\" here when not given")
        ->type_name("DIR");
    command
        .add_option("--option", parsed.assignments,
                    "an option of the help, see \"tovimar options\"; may be repeated")
        ->type_name("NAME=VALUE")
        ->allow_extra_args(false)
        ->take_all();
}

void AddCompilation(CLI::App& command, Arguments& parsed) {
    command.add_flag_callback(
        "--no-compile", [&parsed] { parsed.compile = false; },
        "write project, pages and web help, run no compiler");
    command
        .add_option("--copy-to", parsed.copyTo,
                    "folder of the copy of the compiled help; beside the application when not given")
        ->type_name("DIR");
}

void AddVerbose(CLI::App& command, Arguments& parsed) {
    command.add_flag("--verbose", parsed.verbose, "tell each object, warnings and the compiler's output");
}

void AddWriteBack(CLI::App& command, Arguments& parsed) {
    command.add_flag("--write-back", parsed.writeBack,
                     "write new context ids into the exports of SOURCE; each changed one is kept as .bak");
}

void AddRegenerate(CLI::App& app, Arguments& parsed) {
    auto* command = AddCommand(app, parsed, "regenerate",
                               "add the application's new objects to a help; all that stands in it stays",
                               Command::Regenerate, "tovimar regenerate shop-help");
    AddProject(*command, parsed)->required();
    command
        ->add_option("SOURCE", parsed.source,
                     "the application, where it isn't at the place that is remembered for the project")
        ->check(Existing())
        ->type_name("");
    AddWriteBack(*command, parsed);
    AddYes(*command, parsed);
    AddVerbose(*command, parsed);
}

void AddScreenshot(CLI::App& app, Arguments& parsed) {
    using Kind = Arguments::ObjectKind;
    auto* command =
        AddCommand(app, parsed, "screenshot", "retake the pictures of one form or report of a help",
                   Command::Screenshot, "tovimar screenshot shop-help \"Order Lines\" --topic");
    AddProject(*command, parsed)->required();
    command->add_option("OBJECT", parsed.object, "name of the form or report")->required()->type_name("");
    auto* form = command->add_flag_callback(
        "--form", [&parsed] { parsed.objectKind = Kind::Form; },
        "the form, where a report has the same name");
    command
        ->add_flag_callback(
            "--report", [&parsed] { parsed.objectKind = Kind::Report; },
            "the report, where a form has the same name")
        ->excludes(form);
    command->add_flag("--topic", parsed.topic, "write the topic anew too; the old one is kept beside it");
    AddMovedSource(*command, parsed);
    AddYes(*command, parsed);
}

} // namespace

void AddGenerationSyntax(CLI::App& app, Arguments& parsed) {
    auto* created =
        AddCommand(app, parsed, "new", "make the help project of an application, without its pages yet",
                   Command::New, "tovimar new shop.accdb --output shop-help --option Author=\"A. Smith\"");
    AddSource(*created, parsed, kSource);
    AddOutput(*created, parsed);
    AddYes(*created, parsed);

    auto* generate = AddCommand(app, parsed, "generate", "write the help of an application",
                                Command::Generate, "tovimar generate shop.accdb --output shop-help");
    AddSource(*generate, parsed, kSourceOrProject);
    AddOutput(*generate, parsed);
    AddCompilation(*generate, parsed);
    AddWriteBack(*generate, parsed);
    AddYes(*generate, parsed);
    AddVerbose(*generate, parsed);

    AddRegenerate(app, parsed);

    auto* recompile =
        AddCommand(app, parsed, "recompile", "make a help again from its pages and contents as they stand",
                   Command::Recompile, "tovimar recompile shop-help --open");
    AddProject(*recompile, parsed)->required();
    AddCompilation(*recompile, parsed);
    recompile->add_flag("--open", parsed.open, "show the help afterwards");
    AddMovedSource(*recompile, parsed);
    AddYes(*recompile, parsed);
    AddVerbose(*recompile, parsed);

    AddScreenshot(app, parsed);
}

} // namespace tovimar::cli
