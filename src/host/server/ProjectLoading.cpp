/// A project file on its way into the editor.
#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CHelpPrjSelector.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarParameters.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "host/server/IHelpEditorForm.h"
#include "platform/files/Paths.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarServer";

/// The run works where the project lies.
void TakePlacesOf(const CAddInProject& project) {
    auto& parameters = RunData().Generator().Parameters();
    parameters.SetFolderForGeneratedHelp(platform::WithTrailingBackslash(project.Folder));
    parameters.SetNameOfFolderForGeneratedImages(project.PicsSubfolderName);
}

} // namespace

ResultCode CTovimarServer::ReloadTovimarProject(const std::string& vstrTvpFullPath) {
    ResultCode result = kSuccess;
    const ResultCode trapped =
        Trapped(kClass, "ReloadTovimarProject", [&] { LoadProject(vstrTvpFullPath, result); });
    PassOver([] { RunData().ProgressBarDispose(); });
    return trapped != kSuccess ? trapped : result;
}

void CTovimarServer::CloseEditor() {
    if (!IsFormLoaded("frmHelpEditor") || !helpEditor_)
        return;
    helpEditor_.reset();
    HostAgent().Doevents();
}

void CTovimarServer::LoadProject(const std::string& path, ResultCode& result) {
    auto& data = RunData();
    ProgressWindow progress("Start project loading...", 6);
    progress.Update("Checking selected project...", 1);
    CloseEditor();
    data.Generator().UnLoadTreviewForActiveProject();
    CHelpPrjSelector selector;
    selector.Init();
    if (!BackUpHelpProjectFile(path)) {
        UserWarningMessage("Errors detected while trying to make backup copy of Tovimar project file '" +
                           path + "'.");
        result = kGeneralFailure;
        return;
    }
    HostAgent().Doevents();
    result = data.ReLoadSettings(path, /*vfLoadSettingsFromTvpFile=*/true);
    if (result != kSuccess)
        return;
    progress.Update("Loading settings...", 2);
    result = selector.SetCurrent(path, /*vfLoadingExternalProject=*/true, /*vfSetHelpTreeObject=*/false);
    if (result != kSuccess) {
        HostAgent().Doevents();
        return;
    }
    TakePlacesOf(*Session::CurrentProject());
    const Hourglass hourglass;
    HostAgent().Doevents();
    progress.Update("Loading treeview...", 3);
    result = data.Generator().LoadTreviewForActiveProject(/*vfSkipIfLoaded=*/true);
    if (result != kSuccess)
        return;
    progress.Update("Opening editor form...", 4);
    OpenHelpEditorForm();
    HostAgent().Doevents();
    SetFocusOnHelpEditorForm();
}

} // namespace tovimar
