#include "generation/OpenHelp.h"

#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarCompiler.h"
#include "generation/HelpUtilities.h"
#include "generation/RunProgress.h"
#include "generation/clsHtmlHelp.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <functional>
#include <initializer_list>

namespace tovimar {
namespace {

constexpr const char* kModule = "modTovimarUtils";

bool HasEnding(const std::string& file, std::initializer_list<const char*> endings) {
    return std::any_of(endings.begin(), endings.end(),
                       [&](const char* ending) { return text::EndsWithIgnoringCase(file, ending); });
}

std::string LongDate(std::int64_t time) {
    return LongDateAndTime(platform::LocalTime(time));
}

/// The first file of the folder that counts and is later than the help; traced as "<what>FullPath = ...".
bool HasLaterFile(const std::string& help, std::int64_t helpTime, const char* what,
                  const std::function<bool(const std::string&)>& counts) {
    auto& files = *platform::Env().files;
    const std::string folder = platform::FolderOf(help);
    for (const std::string& file : files.ListFiles(folder, "*.*")) {
        const std::int64_t fileTime = counts(file) ? files.FileTime(folder + file) : helpTime;
        if (fileTime <= helpTime)
            continue;
        const std::string name(what);
        TraceText(
            [&] { return name + "FullPath = " + help + ", " + name + "FileDate = " + LongDate(helpTime); });
        TraceText([&] { return "File = " + file + ", FileDate = " + LongDate(fileTime); });
        return true;
    }
    return false;
}

/// True when the user wants the help as it stands, or it could be made again.
bool AskToRecompile(const std::string& question, bool skipCompilation) {
    if (ShowMessage(question, kMsgYesNo | kMsgQuestion, kApplicationTitle, {}, 0,
                    "modTovimarUtils.OpenHelp") != platform::kAnswerYes)
        return true;
    return CTovimarCompiler().RecompileHelpProject(/*vfSkipOpeningOfRecompiledHelp=*/true, skipCompilation) ==
           kSuccess;
}

/// The current project once it has been generated; null after a warning.
CAddInProject* GeneratedProject() {
    auto* project = Session::CurrentProject();
    if (project != nullptr && !project->HHPFullPath().empty())
        return project;
    WarningDialog("HTML Help project was not yet generated and/or compiled.");
    return nullptr;
}

void ShowCompiledHelp(bool skipStaleCheck) {
    RunData().LoadSettings();
    const auto* project = GeneratedProject();
    if (project == nullptr)
        return;
    const std::string path = project->CHMFullPath();
    if (path.empty()) {
        WarningDialog("HTML Help project was not yet compiled.");
        return;
    }
    if (!platform::Env().files->FileExists(path)) {
        WarningDialog("HTML Help doesn't exist '" + path + "'");
        return;
    }
    if (!skipStaleCheck && IsHelpStale(path) &&
        !AskToRecompile("The help project has been changed since last compilation.\r\n"
                        "Do you want to recompile the HTML Help before opening it ?",
                        /*skipCompilation=*/false))
        return;
    RunData().HtmlHelp().OpenTOC(path, 0);
}

void ShowWebHelp(bool skipStaleCheck) {
    RunData().LoadSettings();
    const auto* project = GeneratedProject();
    if (project == nullptr)
        return;
    const std::string page = platform::Join(project->Folder, "main.htm");
    if (!platform::Env().files->FileExists(page)) {
        WarningDialog("Web Help entry HTML page doesn't exist '" + page + "'");
        return;
    }
    if (!skipStaleCheck && IsWebHelpStale(page) &&
        !AskToRecompile("The help project has been changed since last generation or compilation.\r\n"
                        "Do you want to recompile contents and index of the Web Help before opening it ?",
                        /*skipCompilation=*/true))
        return;
    ShellExecute(page, "open", {}, /*vfWait=*/false);
}

} // namespace

void OpenHelp(bool vfSkipStaleCheck) {
    Trapped(kModule, "OpenHelp", [&] { ShowCompiledHelp(vfSkipStaleCheck); });
}

void OpenWebHelp(bool vfSkipStaleCheck) {
    Trapped(kModule, "OpenWebHelp", [&] { ShowWebHelp(vfSkipStaleCheck); });
}

bool IsHelpStale(const std::string& vstrChmFullPath) {
    auto& files = *platform::Env().files;
    const std::string folder = platform::FolderOf(vstrChmFullPath);
    const auto compiled = files.ListFiles(folder, "*.chm");
    return !compiled.empty() && HasLaterFile(vstrChmFullPath, files.FileTime(folder + compiled.front()),
                                             "CHM", [](const std::string& file) {
                                                 return !HasEnding(file, {".chm", ".tvp"});
                                             });
}

bool IsWebHelpStale(const std::string& vstrMainPageFullPath) {
    auto& files = *platform::Env().files;
    return files.FileExists(vstrMainPageFullPath) &&
           HasLaterFile(vstrMainPageFullPath, files.FileTime(vstrMainPageFullPath), "WebHelp",
                        [](const std::string& file) {
                            return HasEnding(file, {".hhc", ".hhk", ".tvp"});
                        });
}

} // namespace tovimar
