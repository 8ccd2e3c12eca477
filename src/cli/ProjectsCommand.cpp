#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Json.h"
#include "cli/ProjectFile.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Paths.h"
#include "platform/Environment.h"

#include <cstdio>
#include <filesystem>
#include <nlohmann/json.hpp>

namespace tovimar::cli {
namespace {

/// "2026-11-23 06:12:09"; empty for a project that is gone.
std::string Written(const ListedProject& project) {
    if (project.missing)
        return {};
    const auto time = platform::LocalTime(platform::Env().files->FileTime(project.file));
    char text[64];
    std::snprintf(text, sizeof text, "%04d-%02d-%02d %02d:%02d:%02d", time.year, time.month, time.day,
                  time.hour, time.minute, time.second);
    return text;
}

bool IsThere(const std::string& native) {
    std::error_code ignored;
    return std::filesystem::exists(native, ignored);
}

void ShowAsJson(const std::vector<ListedProject>& projects) {
    auto all = nlohmann::ordered_json::array();
    for (const ListedProject& project : projects)
        all.push_back({{"name", project.name},
                       {"title", project.title},
                       {"project", platform::Env().files->ToNative(project.file)},
                       {"source", NativeSource(project.source)},
                       {"written", Written(project)},
                       {"missing", project.missing}});
    PrintJson(all);
}

void Show(const ListedProject& project) {
    const bool titled = !project.title.empty() && project.title != project.name;
    const std::string source = NativeSource(project.source);
    PrintResult(project.name + (titled ? "  \"" + project.title + "\"" : ""));
    PrintResult("  Project: " + platform::Env().files->ToNative(project.file) +
                (project.missing ? "  (missing)" : ""));
    PrintResult("  Source:  " + source + (IsThere(source) ? "" : "  (missing)"));
    if (!project.missing)
        PrintResult("  Written: " + Written(project));
}

int Forget(const Arguments& arguments) {
    const auto found = FindListed(arguments.project);
    if (!found)
        throw Stop{"the catalogue has no project '" + arguments.project + "'"};
    // An entry without its project file isn't in the list any more, and saving drops it.
    CAddInProjects catalogue;
    catalogue.Init(CataloguePath());
    catalogue.Forget(found->file);
    catalogue.Save();
    return kDone;
}

} // namespace

int ListProjects(const Arguments& arguments) {
    const auto projects = ListedProjects();
    if (arguments.json)
        ShowAsJson(projects);
    else if (projects.empty())
        PrintHint("The catalogue has no help projects yet.");
    else
        for (const ListedProject& project : projects)
            Show(project);
    return kDone;
}

int ForgetProject(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Forget(arguments); });
}

} // namespace tovimar::cli
