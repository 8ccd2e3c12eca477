/// What the menu calls: most of it is handed on to the user's actions.
#include "foundation/ErrorTrap.h"
#include "foundation/LoadedForms.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarActions.h"
#include "generation/IHelpWizardForm.h"
#include "generation/RunProgress.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CRequestQueue.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/IHelpEditorForm.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarServer";
constexpr const char* kEditor = "frmHelpEditor";
constexpr const char* kWizard = "frmHelpWizard";

void Refuse(const std::string& text, const char* source) {
    ShowMessage(text, kMsgExclamation, kApplicationTitle, {}, 0, source);
}

/// An unsaved workbook has no place for its help. False after a warning.
bool HostCanHaveNewProject() {
    auto& host = HostAgent();
    if (!host.IDEDisplayModelIsMDI()) {
        UserWarningMessage("This version of Tovimar Add-In doesn't support SDI display model of host "
                           "application IDE.\r\nPlease switch to MDI display model.");
        return false;
    }
    if (text::EqualsIgnoringCase(host.CurrentSourceProjectTypeName(), SourceProjectKind::kMSExcel) &&
        host.CurrentSourceProjectFullPath().empty()) {
        UserWarningMessage("There is no any workbook opened or\r\nopened active workbook is not saved.");
        return false;
    }
    return true;
}

} // namespace

LoadedForm* CTovimarServer::GetLoadedForm(const std::string& name) const {
    return Session::Forms().Find(name);
}

void CTovimarServer::OpenNewProject() {
    Trapped(kClass, "OpenNewProject", [this] {
        if (IsFormLoaded(kEditor))
            Refuse("Please close Tovimar's HTML Editor form before opening Wizard form.",
                   "CTovimarServer.OpenNewProject");
        else if (HostCanHaveNewProject())
            Actions().OpenNewProject();
    });
}

void CTovimarServer::ReloadNewProject() {
    Trapped(kClass, "ReloadNewProject", [this] {
        if (!queue_)
            queue_ = std::make_unique<CRequestQueue>();
        queue_->Queue("ReloadWizardForm");
    });
}

void CTovimarServer::OpenProject() {
    Trapped(kClass, "OpenProject", [this] {
        constexpr const char* kSource = "CTovimarServer.OpenProject";
        if (IsFormLoaded(kEditor))
            Refuse("Please close Tovimar's HTML Editor form before opening help project.", kSource);
        else if (IsFormLoaded(kWizard))
            Refuse("Please close Tovimar's Wizard form before opening help project.", kSource);
        else
            Actions().OpenProject();
    });
}

ResultCode CTovimarServer::ProcessWizardFormClosing(IHelpWizardForm& wizard) {
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "ProcessWizardFormClosing",
                                       [&] { result = Actions().ProcessWizardFormClosing(wizard); });
    return trapped != kSuccess ? trapped : result;
}

void CTovimarServer::OpenHelpOfActiveProject() {
    Trapped(kClass, "OpenHelpOfActiveProject", [this] { Actions().OpenHelpOfActiveProject(); });
}

void CTovimarServer::OpenWebHelpOfActiveProject() {
    Trapped(kClass, "OpenWebHelpOfActiveProject", [this] { Actions().OpenWebHelpOfActiveProject(); });
}

void CTovimarServer::OpenHelpProject() {
    Trapped(kClass, "OpenHelpProject", [this] {
        if (IsFormLoaded(kEditor))
            SetFocusOnHelpEditorForm();
        else
            Actions().OpenHelpProject();
    });
}

void CTovimarServer::OpenHelpProjectIndex() {
    Trapped(kClass, "OpenHelpProjectIndex", [this] { Actions().OpenHelpProjectIndex(); });
}

void CTovimarServer::OpenHelpFolder() {
    Trapped(kClass, "OpenHelpFolder", [this] { Actions().OpenHelpFolder(); });
}

ResultCode CTovimarServer::RecompileHelpProject(bool vfSkipOpeningOfRecompiledHelp) {
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "RecompileHelpProject", [&] {
        result = Actions().RecompileHelpProject(vfSkipOpeningOfRecompiledHelp);
    });
    return trapped != kSuccess ? trapped : result;
}

ResultCode CTovimarServer::RegenerateHelpProject() {
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "RegenerateHelpProject", [&] {
        auto& host = HostAgent();
        host.SetCurrentSourceProject(host.CurrentSourceProjectName());
        result = Actions().RegenerateHelpProject();
    });
    return trapped != kSuccess ? trapped : result;
}

void CTovimarServer::OpenHelpTopics() {
    Trapped(kClass, "OpenHelpTopics", [this] { Actions().OpenHelpTopics(); });
}

void CTovimarServer::OpenHelpIndex() {
    Trapped(kClass, "OpenHelpIndex", [this] { Actions().OpenHelpIndex(); });
}

void CTovimarServer::OpenHelpSearch() {
    Trapped(kClass, "OpenHelpSearch", [this] { Actions().OpenHelpSearch(); });
}

void CTovimarServer::OpenAboutForm() {
    Trapped(kClass, "OpenAboutForm", [this] { Actions().OpenAboutForm(); });
}

bool CTovimarServer::TakeScreenshotAction() {
    bool taken = false;
    Trapped(kClass, "TakeScreenshotAction", [&] { taken = Actions().TakeScreenshotAction(); });
    return taken;
}

void CTovimarServer::GetScreenshotOptions() {
    Trapped(kClass, "GetScreenshotOptions", [this] { Actions().GetScreenshotOptions(); });
}

void CTovimarServer::OpenHelpEditorForm() {
    Trapped(kClass, "OpenHelpEditorForm", [this] {
        if (IsFormLoaded(kWizard)) {
            Refuse("Please close Tovimar's Wizard form before opening Help Editor.",
                   "CTovimarServer.OpenHelpEditorForm");
            return;
        }
        if (!helpEditor_ && MakeHelpEditorForm)
            helpEditor_ = MakeHelpEditorForm();
        if (!helpEditor_)
            return;
        helpEditor_->Init();
        helpEditor_->OpenRootDocument();
        helpEditor_->Display();
    });
}

void CTovimarServer::SetFocusToHTMLEditor() {
    Trapped(kClass, "SetFocusToHTMLEditor", [this] {
        if (helpEditor_)
            helpEditor_->SetFocusToHTMLEditor();
    });
}

void CTovimarServer::SetFocusOnHelpEditorForm() {
    Trapped(kClass, "SetFocusOnHelpEditorForm", [this] {
        if (LoadedForm* editor = GetLoadedForm(kEditor)) {
            editor->SetVisible(true);
            editor->SetFocus();
        }
    });
}

void CTovimarServer::CloseFormsOnDisconnection() {
    Trapped(kClass, "CloseFormsOnDisconnection", [this] {
        WriteTraceLogMessage("Close forms on disconnection");
        if (actions_)
            actions_->CloseWizardFormOnDisconnection();
        if (!helpEditor_)
            return;
        helpEditor_.reset();
        WriteTraceLogMessage("Help Editor closed OK.");
    });
}

} // namespace tovimar
