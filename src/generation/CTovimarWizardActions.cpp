/// The road of a generation through the wizard.
#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/CCodePages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "generation/HelpUtilities.h"
#include "generation/IHelpWizardForm.h"
#include "generation/RunProgress.h"
#include "generation/clsHtmlHelp.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"

#include <utility>

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarActions";

/// The wizard's files: pages, code pages and the sample of its preview. False after a warning.
bool HasWizardFiles() {
    const std::string sample =
        SettingsFolder() +
        (Session::Parameters()->MakeNormalViewScreenshots ? "SampleFormNV" : "SampleFormDV");
    const std::pair<const char*, std::string> needed[] = {
        {"Wizard form definition file", WizardDefinitionFile()},
        {"Code pages definition file", SettingsFolder() + "CodePages.xml"},
        {"Sample form definition file", sample + ".xml"},
        {"Sample form picture file", sample + ".jpg"}};
    for (const auto& [what, path] : needed)
        if (!platform::Env().files->FileExists(path)) {
            WarningDialog(std::string(what) + " is missing '" + path + "'.");
            return false;
        }
    return true;
}

/// Web forms have neither pictures nor menus.
void TurnOffWhatWebFormsLack() {
    if (!text::EqualsIgnoringCase(HostAgent().CurrentSourceProjectTypeName(), SourceProjectKind::kAspNet))
        return;
    auto& parameters = *Session::Parameters();
    const std::pair<const char*, bool*> options[] = {
        {"AddHotSpotsForForm", &parameters.AddHotSpotsForForm},
        {"AddImageForForm", &parameters.AddImageForForm},
        {"AddControlsListForMenuList", &parameters.AddControlsListForMenuList},
        {"AddControlsSectionForMenuList", &parameters.AddControlsSectionForMenuList}};
    for (const auto& [name, parameter] : options) {
        *parameter = false;
        if (auto* settings = Session::Settings())
            settings->SetOptionValue(name, Value(false));
    }
}

} // namespace

void CTovimarActions::OpenNewProject() {
    Trapped(kClass, "OpenNewProject", [&] {
        if (!RunData().IsMSAccessDbOpened())
            return;
        RunData().LoadSettings(/*vfSkipIfLoaded=*/true);
        RunData().HtmlHelp().CloseAll();
        OpenWizardForm(/*vfLoadSettings=*/true);
    });
}

void CTovimarActions::OpenWizardForm(bool vfLoadSettings) {
    Trapped(kClass, "OpenWizardForm", [&] {
        if (!vfLoadSettings)
            RunData().LoadSettings(/*vfSkipIfLoaded=*/true);
        SourceProjects projects;
        if (!MakeWizardForm || !RunData().IsMSAccessDbOpened() || !ListSourceProjects(projects) ||
            !HasWizardFiles())
            return;
        DropWizard();
        closedWizard_.reset();
        platform::Env().doEvents();
        if (!FindUsableProjects(projects))
            return;
        auto& catalogue = *Session::Projects();
        catalogue.RemoveTempProjects();
        auto project = NewProject(projects, catalogue.GetUniqueProjectName(projects.current));
        if (project == nullptr)
            return;
        earlierProjectFile_.clear();
        MakeTemporaryProject(projects, std::move(project));
        TurnOffWhatWebFormsLack();
        wizard_ = MakeWizardForm();
        wizard_->Init();
        wizard_->Show();
    });
}

void CTovimarActions::DropWizard() {
    if (wizard_ == nullptr)
        return;
    closedWizard_ = std::move(wizard_);
    closedWizard_->Terminate();
}

void CTovimarActions::CloseWizardFormOnDisconnection() {
    if (wizard_ == nullptr)
        return;
    DropWizard();
    TraceText([] { return std::string("Wizard from closed OK."); });
}

ResultCode CTovimarActions::CheckAndSaveOptions() {
    HostAgent().HourglassOn();
    HostAgent().ProgressMeterInit("Checking help generation options...", 2);
    if (const ResultCode refused = CheckIfGenerationPossible(); refused != kSuccess)
        return refused;
    HostAgent().ProgressMeterInit("Saving settings...", 2);
    HostAgent().ProgressMeterUpdate(1);
    const ResultCode failed =
        Session::Settings() == nullptr ? kSuccess : Session::Settings()->Save(UserSettingsFile());
    if (failed == kSuccess)
        TakeRunOptions();
    return failed;
}

ResultCode CTovimarActions::ProcessWizardFormClosing(IHelpWizardForm& wizard) {
    const bool ok = wizard.OK();
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "ProcessWizardFormClosing", [&] {
        wizard.Hide();
        if (ok)
            result = CheckAndSaveOptions();
        if (result != kSuccess) {
            wizard.Show();
            return;
        }
        DropWizard();
        if (!ok)
            return;
        HostAgent().ProgressMeterInit("Loading TOC treeview...", 2);
        HostAgent().ProgressMeterUpdate(1);
        Session::Generator()->LoadTreviewForActiveProject(/*vfSkipIfLoaded=*/true);
        CompleteTree();
        RunGeneration();
    });
    EndRun(ok);
    if (ok && Session::Server() != nullptr)
        Session::Server()->SetFocusOnHelpEditorForm();
    return trapped != kSuccess ? trapped : result;
}

} // namespace tovimar
