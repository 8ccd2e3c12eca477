/// The user's actions on the current help project and on the system's own help.
#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarCompiler.h"
#include "generation/HelpUtilities.h"
#include "generation/IHelpWizardForm.h"
#include "generation/OpenHelp.h"
#include "generation/RunProgress.h"
#include "generation/clsHtmlHelp.h"
#include "generation/frmOpenHelpProject.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "screenshots/clsScreenshotOptions.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarActions";

/// How most actions begin; false after a warning.
bool Begin() {
    if (!RunData().IsMSAccessDbOpened())
        return false;
    RunData().LoadSettings(/*vfSkipIfLoaded=*/true);
    return true;
}

/// Begin of an action on a file of the current help project, which must not be locked.
bool BeginOnFile() {
    if (!Begin())
        return false;
    RunData().HtmlHelp().CloseAll();
    return true;
}

/// Of the current project; empty without one.
std::string ProjectPath(std::string (CAddInProject::*path)() const) {
    const auto* project = Session::CurrentProject();
    return project == nullptr ? std::string() : (project->*path)();
}

void OpenFile(const std::string& path, const char* what) {
    if (path.empty())
        WarningDialog("HTML help project was not generated.");
    else if (!platform::Env().files->FileExists(path))
        WarningDialog(std::string(what) + " doesn't exist '" + path + "'.");
    else
        ShellExecute(path, "open", {}, /*vfWait=*/false);
}

/// The system's own help, over the host's window.
void OpenOwnHelp(const char* operation, void (clsHtmlHelp::*open)(const std::string&, std::int32_t)) {
    Trapped(kClass, operation, [&] {
        RunData().LoadSettings(/*vfSkipIfLoaded=*/true);
        const std::string path = OwnHelpFile();
        if (platform::Env().files->FileExists(path))
            (RunData().HtmlHelp().*open)(path, RunData().HostAppMainWindowHWnd());
        else
            WarningDialog("Help doesn't exist '" + path + "'.");
    });
}

} // namespace

void CTovimarActions::OpenProject() {
    Trapped(kClass, "OpenProject", [] {
        if (!RunData().IsMSAccessDbOpened())
            return;
        auto& server = *Session::Server();
        if (server.IsFormLoaded("frmHelpEditor")) {
            server.SetFocusOnHelpEditorForm();
            return;
        }
        RunData().LoadSettings(/*vfSkipIfLoaded=*/true);
        RunData().HtmlHelp().CloseAll();
        if (!frmOpenHelpProject::ShowDialog)
            return;
        frmOpenHelpProject dialog;
        frmOpenHelpProject::ShowDialog(dialog);
        HostAgent().Doevents();
        if (!dialog.ProjectDefFullPath().empty())
            server.ReloadTovimarProject(dialog.ProjectDefFullPath());
        if (dialog.NewProjectChosen())
            server.OpenNewProject();
    });
}

void CTovimarActions::OpenHelpOfActiveProject() {
    Trapped(kClass, "OpenHelpOfActiveProject", [] {
        if (!Begin())
            return;
        platform::Env().doEvents();
        OpenHelp(/*vfSkipStaleCheck=*/false);
    });
}

void CTovimarActions::OpenWebHelpOfActiveProject() {
    Trapped(kClass, "OpenWebHelpOfActiveProject", [] {
        if (!Begin())
            return;
        platform::Env().doEvents();
        OpenWebHelp(/*vfSkipStaleCheck=*/false);
    });
}

void CTovimarActions::OpenHelpProject() {
    Trapped(kClass, "OpenHelpProject", [] {
        if (BeginOnFile())
            OpenFile(ProjectPath(&CAddInProject::HHPFullPath), "HTML help project");
    });
}

void CTovimarActions::OpenHelpProjectIndex() {
    Trapped(kClass, "OpenHelpProjectIndex", [] {
        if (BeginOnFile())
            OpenFile(ProjectPath(&CAddInProject::HHKFullPath), "HTML help project index");
    });
}

void CTovimarActions::OpenHelpFolder() {
    Trapped(kClass, "OpenHelpFolder", [] {
        if (!BeginOnFile())
            return;
        const std::string folder = platform::FolderOf(ProjectPath(&CAddInProject::HHPFullPath));
        if (folder.empty())
            WarningDialog("HTML help project folder is empty.");
        else if (!platform::Env().files->FolderExists(folder))
            WarningDialog("HTML help project folder doesn't exist '" + folder + "'.");
        else
            ShellExecute(folder, "open", {}, /*vfWait=*/false);
    });
}

ResultCode CTovimarActions::RecompileHelpProject(bool vfSkipOpeningOfRecompiledHelp) {
    return CTovimarCompiler().RecompileHelpProject(vfSkipOpeningOfRecompiledHelp);
}

ResultCode CTovimarActions::RegenerateHelpProject() {
    return CTovimarCompiler().RegenerateHelpProject();
}

void CTovimarActions::OpenHelpTopics() {
    OpenOwnHelp("OpenHelpTopics", &clsHtmlHelp::OpenTOC);
}

void CTovimarActions::OpenHelpIndex() {
    OpenOwnHelp("OpenHelpIndex", &clsHtmlHelp::OpenIndex);
}

void CTovimarActions::OpenHelpSearch() {
    OpenOwnHelp("OpenHelpSearch", &clsHtmlHelp::OpenSearch);
}

void CTovimarActions::OpenAboutForm() {
    Trapped(kClass, "OpenAboutForm", [this] {
        RunData().LoadSettings(/*vfSkipIfLoaded=*/true);
        if (ShowAboutForm)
            ShowAboutForm(RunData().HostAppMainWindowHWnd());
    });
}

} // namespace tovimar
