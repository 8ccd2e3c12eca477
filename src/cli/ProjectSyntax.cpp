#include "cli/Syntax.h"
#include "cli/SyntaxWords.h"
#include "cli/TreeSteps.h"

namespace tovimar::cli {
namespace {

using Command = Arguments::Command;

void AddOpen(CLI::App& app, Arguments& parsed) {
    auto* open = AddCommand(app, parsed, "open", "show a help, asking first whether to renew a stale one",
                            Command::Open, "tovimar open web shop-help");
    open->add_option("WHAT", parsed.what,
                     "help (the compiled one), web (the web help) or folder; help when not given")
        ->check(CLI::IsMember({"help", "web", "folder"}).description(""))
        ->type_name("");
    AddProject(*open, parsed);
    // "open shop" names a project.
    open->validate_positionals();
    AddMovedSource(*open, parsed);
    AddYes(*open, parsed);
    open->footer("Without PROJECT that of the working folder, or the only one of the catalogue.\n"
                 "The environment variable TOVIMAR_VIEWER may name the program that shows it.\n\n" +
                 open->get_footer());
}

void AddProjects(CLI::App& app, Arguments& parsed) {
    auto* projects = AddCommand(app, parsed, "projects", "show the catalogue of help projects",
                                Command::ListProjects, "tovimar projects forget shop");
    AddJson(*projects, parsed);
    auto* list = projects->add_subcommand("list", "show them; as \"projects\" alone does");
    AddJson(*list, parsed);
    auto* forget =
        AddCommand(*projects, parsed, "forget", "take a project out of the catalogue; its files stay",
                   Command::ForgetProject, "tovimar projects forget shop");
    AddProject(*forget, parsed)->required();
    projects->require_subcommand(0, 1);
}

void AddContents(CLI::App& app, Arguments& parsed) {
    auto* contents = AddCommand(app, parsed, "contents", "show the table of contents of a help",
                                Command::Contents, "tovimar contents shop-help --json");
    AddProject(*contents, parsed)->required();
    contents->add_flag("--all", parsed.all, "topics that are left out and the controls of forms, too");
    contents->add_flag("--numbers", parsed.numbers,
                       "a number before each entry, as \"tovimar tree\" takes it");
    AddJson(*contents, parsed);
}

void AddTree(CLI::App& app, Arguments& parsed) {
    using Pages = Arguments::Pages;
    auto* tree =
        AddCommand(app, parsed, "tree", "rearrange the table of contents of a help", Command::Tree,
                   "tovimar tree shop-help move Forms/Orders Basics then new Basics \"First steps\"");
    AddProject(*tree, parsed)->required();
    tree->add_option("OPERATION", parsed.words,
                     "what to do, see below; without one all entries are shown with their numbers")
        ->type_name("");
    auto* keep = tree->add_flag_callback(
        "--keep-page", [&parsed] { parsed.pages = Pages::Keep; }, "the pages of deleted entries stay");
    tree->add_flag_callback(
            "--delete-page", [&parsed] { parsed.pages = Pages::Delete; },
            "the pages of deleted entries go with them")
        ->excludes(keep);
    AddYes(*tree, parsed);
    AddJson(*tree, parsed);
    tree->footer(TreeOperationsText() +
                 "\nNODE and GROUP are entries: titles with slashes between them (Forms/Orders), a page\n"
                 "(Orders.htm), or a number of \"tovimar contents --numbers\"; 0 is the project itself.\n"
                 "All is saved behind the last operation, or nothing.\n\n" +
                 tree->get_footer());
}

void AddSettings(CLI::App& app, Arguments& parsed) {
    auto* settings =
        AddCommand(app, parsed, "settings", "show and change the options that the next help starts with",
                   Command::ListSettings, "tovimar settings set Author \"A. Smith\" --project shop-help");
    const auto addShared = [&parsed](CLI::App& command) {
        command
            .add_option("--project", parsed.project,
                        "the options of this help project: a project file, its folder or a name")
            ->type_name("PROJECT");
        AddJson(command, parsed);
    };
    const auto addName = [&parsed](CLI::App& command) {
        command.add_option("NAME", parsed.settingName, "see \"tovimar options\"")->required()->type_name("");
    };
    addShared(*settings);
    auto* list = settings->add_subcommand("list", "show them all; as \"settings\" alone does");
    addShared(*list);
    auto* get = AddCommand(*settings, parsed, "get", "print the value of one", Command::GetSetting,
                           "tovimar settings get Author");
    addName(*get);
    addShared(*get);
    auto* set = AddCommand(*settings, parsed, "set", "give one another value", Command::SetSetting,
                           "tovimar settings set SnapshotFormat Bitmap");
    addName(*set);
    set->add_option("VALUE", parsed.settingValue, "may be empty (\"\")")->required()->type_name("");
    addShared(*set);
    settings->require_subcommand(0, 1);
}

CLI::Option* AddDatabase(CLI::App& command, Arguments& parsed) {
    return command.add_option("DATABASE", parsed.source, "the database file (.accdb, .mdb)")
        ->required()
        ->check(CLI::Validator(CLI::ExistingFile).description(""))
        ->type_name("");
}

void AddDatabaseCommands(CLI::App& app, Arguments& parsed) {
    auto* inspect = AddCommand(app, parsed, "inspect",
                               "show what is read of a database's designs, and what in them doesn't agree",
                               Command::Inspect, "tovimar inspect shop.accdb Orders --form");
    AddDatabase(*inspect, parsed);
    inspect
        ->add_option("OBJECT", parsed.object,
                     "a form, report, macro or module; all of them in short when not given")
        ->type_name("");
    auto* form = inspect->add_flag_callback(
        "--form", [&parsed] { parsed.objectKind = Arguments::ObjectKind::Form; }, "forms only");
    inspect
        ->add_flag_callback(
            "--report", [&parsed] { parsed.objectKind = Arguments::ObjectKind::Report; }, "reports only")
        ->excludes(form);
    AddJson(*inspect, parsed);
    auto* texts = AddCommand(app, parsed, "export",
                             "write a database's forms, reports, macros, modules and queries as texts",
                             Command::ExportTexts, "tovimar export shop.accdb --output shop-source");
    AddDatabase(*texts, parsed);
    texts
        ->add_option("--output", parsed.output, "folder to write to; files that stay the same aren't touched")
        ->required()
        ->type_name("DIR");
}

} // namespace

void AddProjectSyntax(CLI::App& app, Arguments& parsed) {
    AddOpen(app, parsed);
    AddProjects(app, parsed);
    AddContents(app, parsed);
    AddTree(app, parsed);
    AddSettings(app, parsed);
}

void AddSourceSyntax(CLI::App& app, Arguments& parsed) {
    auto* list = AddCommand(app, parsed, "list", "show the objects of an application by kind, with captions",
                            Command::List, "tovimar list shop.accdb");
    AddSource(*list, parsed,
              "folder of text exports, database file (.accdb, .mdb), or a folder that holds both");
    AddJson(*list, parsed);
    AddCommand(app, parsed, "options", "show the options of a help with their meaning", Command::Options,
               "tovimar options");
    AddDatabaseCommands(app, parsed);
    auto* convert = AddCommand(app, parsed, "convert-contents",
                               "turn a contents file of another help (.hhc) into a project's contents",
                               Command::ConvertContents, "tovimar convert-contents old.hhc --output old.tvp");
    convert->add_option("FILE", parsed.source, "the contents file")
        ->required()
        ->check(CLI::Validator(CLI::ExistingFile).description(""))
        ->type_name("");
    convert->add_option("--output", parsed.output, "file to write; standard output when not given")
        ->type_name("FILE");
}

} // namespace tovimar::cli
