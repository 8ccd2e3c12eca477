#include "cli/ProjectFile.h"

#include "cli/Stop.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Paths.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <algorithm>
#include <unistd.h>

namespace tovimar::cli {
namespace {

constexpr const char* kHelp = "Name a project file (.tvp), a folder that holds one, or a name that \"tovimar "
                              "projects\" shows.";

std::string Candidates(const std::vector<ListedProject>& projects) {
    std::string lines;
    for (const ListedProject& project : projects)
        lines += "\n" + project.name + "  " + platform::Env().files->ToNative(project.file);
    return lines;
}

std::string NameAttribute(const XmlNode& element) {
    const std::string name = element.attribute("name");
    return name.empty() ? element.attribute("Name") : name;
}

ListedProject Listed(const XmlNode& element, CAddInProjects& catalogue) {
    ListedProject listed;
    listed.name = NameAttribute(element);
    listed.source = element.attribute("SourceProjectFullPath");
    listed.file = platform::Join(element.attribute("Folder"), element.attribute("FileName") + ".tvp");
    listed.missing = !platform::Env().files->FileExists(listed.file);
    if (const auto* project = catalogue.GetProjectDefinitionByTvpFullPath(listed.file))
        listed.title = project->Title();
    return listed;
}

/// Empty when the folder holds none.
std::string OnlyProjectIn(const std::string& folder) {
    const auto found = platform::Env().files->ListFiles(folder, "*.tvp");
    if (found.size() > 1)
        throw Stop{"'" + folder + "' holds several help projects: " + text::Join(found, ", ") +
                   "\nName one of these files."};
    return found.empty() ? std::string() : platform::Join(folder, found.front());
}

std::string OnlyListed(const std::string& typed) {
    const auto found = FindListed(typed);
    if (!found)
        return {};
    if (found->missing)
        throw Stop{"the project '" + found->name + "' isn't at '" + found->file +
                   "' any more\n\"tovimar projects forget " + found->name +
                   "\" takes it out of the catalogue."};
    return found->file;
}

std::string DefaultProject() {
    auto& files = *platform::Env().files;
    if (std::string file = OnlyProjectIn(files.FromNative(FullPath("."))); !file.empty())
        return file;
    auto listed = ListedProjects();
    std::erase_if(listed, [](const ListedProject& project) { return project.missing; });
    if (listed.size() == 1)
        return listed.front().file;
    throw Stop{listed.empty()
                   ? std::string("there is no help project here, and the catalogue has none\n") + kHelp
                   : "there is no help project here; which one of the catalogue?" + Candidates(listed),
               kUsage};
}

} // namespace

std::vector<ListedProject> ListedProjects() {
    CAddInProjects catalogue;
    catalogue.Init(CataloguePath());
    std::vector<ListedProject> projects;
    XmlDocument document;
    if (document.load(CataloguePath()))
        for (const XmlNode& element : document.selectSingleNode("//Projects").childElements())
            projects.push_back(Listed(element, catalogue));
    return projects;
}

std::optional<ListedProject> FindListed(const std::string& typed) {
    auto projects = ListedProjects();
    const std::string path =
        platform::WithoutTrailingBackslash(platform::Env().files->FromNative(FullPath(typed)));
    const auto isPath = [&](const ListedProject& project) {
        return text::EqualsIgnoringCase(project.file, path) ||
               text::EqualsIgnoringCase(platform::WithoutTrailingBackslash(platform::FolderOf(project.file)),
                                        path);
    };
    std::erase_if(projects, [&](const ListedProject& project) {
        return !text::EqualsIgnoringCase(project.name, typed) && !isPath(project);
    });
    if (projects.size() > 1)
        throw Stop{"the catalogue has several projects '" + typed +
                   "'; name the file of one:" + Candidates(projects)};
    return projects.empty() ? std::nullopt : std::optional(projects.front());
}

std::string FindProjectFile(const std::string& typed) {
    if (typed.empty())
        return DefaultProject();
    auto& files = *platform::Env().files;
    const std::string path = files.FromNative(FullPath(typed));
    const bool folder = files.FolderExists(path);
    if (folder && access(files.ToNative(path).c_str(), R_OK | X_OK) != 0)
        throw Stop{"no permission to read '" + path + "'"};
    std::string file = folder ? OnlyProjectIn(path) : files.FileExists(path) ? path : std::string();
    // A name of the catalogue may also be that of a folder here, such as the application's.
    if (file.empty() && typed.find('/') == std::string::npos)
        file = OnlyListed(typed);
    if (file.empty() && folder)
        throw Stop{"there is no help project (.tvp) in '" + path + "'"};
    if (file.empty())
        throw Stop{"there is no help project '" + typed + "'\n" + kHelp};
    CheckProjectFile(file);
    return file;
}

std::string NativeSource(const std::string& remembered) {
    auto& files = *platform::Env().files;
    return files.ToNative(files.FileExists(remembered)
                              ? remembered
                              : platform::WithoutTrailingBackslash(platform::FolderOf(remembered)));
}

void CheckProjectFile(const std::string& file) {
    platform::Env().files->ReadFile(file);
    XmlDocument document;
    if (!document.load(file))
        throw Stop{"'" + file +
                   "' is no help project: " + text::TrimWhitespace(document.parseError().reason)};
    if (!document.selectSingleNode("//TovimarProject/Project"))
        throw Stop{"'" + file + "' is no help project"};
}

} // namespace tovimar::cli
