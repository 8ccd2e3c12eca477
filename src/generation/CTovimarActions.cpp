#include "generation/CTovimarActions.h"

#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarParameters.h"
#include "generation/CTovimarStats.h"
#include "generation/HelpUtilities.h"
#include "generation/IHelpWizardForm.h"
#include "generation/RunProgress.h"
#include "generation/clsHtmlHelp.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "screenshots/clsScreenshotOptions.h"

#include <algorithm>
#include <utility>

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarActions";

bool FileExists(const std::string& path) {
    return !path.empty() && platform::Env().files->FileExists(path);
}

/// A project file that the catalogue doesn't know belongs to the source that its objects name.
bool NamesSource(const XmlDocument& file, const std::string& sourceName) {
    const auto nodes = file.selectNodes("//*[@SourceProjectName]");
    return std::all_of(nodes.begin(), nodes.end(), [&](const XmlNode& node) {
        const std::string name = node.attribute("SourceProjectName");
        return name.empty() || text::EqualsIgnoringCase(name, sourceName);
    });
}

void SkipNode(CHelpPrjTreeNode& node) {
    node.SetSkipped(true);
    for (const auto& child : node.Children())
        SkipNode(*child);
}

/// The pages of a kind that is turned off stay out of the help with all that is below them.
void SkipKindsThatAreOff(CHelpPrjTreeNode& node, const CTovimarParameters& parameters) {
    const std::string page = text::ToLower(node.TemplateHtmlFile());
    const bool off = ((page == "forms.htm" || page == "dialogs.htm") && !parameters.GenerateHelpForForms) ||
                     (page == "reports.htm" && !parameters.GenerateHelpForReports) ||
                     (page == "tables.htm" && !parameters.GenerateHelpForTables) ||
                     (page == "queries.htm" && !parameters.GenerateHelpForQueries) ||
                     (page == "macros.htm" && !parameters.GenerateHelpForMacros);
    if (off)
        SkipNode(node);
    for (const auto& child : node.Children())
        SkipKindsThatAreOff(*child, parameters);
}

bool Lists(const KeyedList<std::string>& names, const std::string& wanted) {
    for (const std::string& name : names)
        if (text::EqualsIgnoringCase(name, wanted))
            return true;
    return false;
}

} // namespace

CTovimarActions::CTovimarActions() = default;

CTovimarActions::~CTovimarActions() {
    Terminate();
}

// The screenshot options are made at their first read: the settings load later.
void CTovimarActions::Init() {
    terminated_ = false;
}

void CTovimarActions::Terminate() {
    if (terminated_)
        return;
    terminated_ = true;
    PassOver([this] { DropWizard(); });
    closedWizard_.reset();
    screenshotOptions_.reset();
}

bool CTovimarActions::PrepareProject(const GenerationRequest& request) {
    bool prepared = false;
    Trapped(kClass, "PrepareProject", [&] {
        SourceProjects projects;
        if (!ListSourceProjects(projects) || !FindUsableProjects(projects))
            return;
        Session::Projects()->RemoveTempProjects();
        auto project =
            NewProject(projects, request.projectName.empty() ? projects.current : request.projectName);
        if (project == nullptr)
            return;
        auto& parameters = *Session::Parameters();
        parameters.SetFolderForGeneratedHelp(request.folder);
        TakeOverEarlierProject(*project);
        MakeTemporaryProject(projects, std::move(project));
        if (!request.application.empty())
            parameters.ApplicationNameStr = request.application;
        parameters.SetHelpProjectTitle(request.title.empty() ? parameters.ApplicationNameStr : request.title);
        prepared = true;
    });
    return prepared;
}

bool CTovimarActions::ListSourceProjects(SourceProjects& projects) {
    projects.listed = HostAgent().GetSourceProjectsList();
    if (!projects.listed.Empty())
        return true;
    ShowMessage("No Projects!", kMsgExclamation, kApplicationTitle, {}, 0, "CTovimarActions.OpenWizardForm");
    return false;
}

bool CTovimarActions::FindUsableProjects(SourceProjects& projects) {
    auto& host = HostAgent();
    const std::string name = projects.current = host.CurrentSourceProjectName();
    if (!Lists(projects.listed, name)) {
        WarningDialog("Source project '" + name +
                      "' not found in the list of available source projects:\r\n" +
                      concatProjectsListFromCollection(projects.listed));
        return false;
    }
    for (const std::string& listed : projects.listed) {
        host.SetCurrentSourceProject(listed);
        const std::string path = host.CurrentSourceProjectFullPath();
        TraceText([&] {
            return "Name = " + listed + ", Type = " + host.CurrentSourceProjectTypeName() +
                   ", FullPath = " + path;
        });
        if (!path.empty())
            projects.usable.Add(listed);
    }
    host.SetCurrentSourceProject(name);
    return true;
}

std::unique_ptr<CAddInProject> CTovimarActions::NewProject(const SourceProjects& projects,
                                                           const std::string& name) {
    auto project = std::make_unique<CAddInProject>();
    project->Name = name;
    project->SourceProjectFullPath = HostAgent().CurrentSourceProjectFullPath();
    if (!project->SourceProjectFullPath.empty())
        return project;
    WarningDialog("Can't get unique help project name for source project '" + projects.current + "'.");
    return nullptr;
}

/// The current project until a run saves it.
void CTovimarActions::MakeTemporaryProject(const SourceProjects& projects,
                                           std::unique_ptr<CAddInProject> project) {
    project->HasSeveralSourceProjects = projects.usable.Count() > 1;
    project->SetSourceProjectsList(project->HasSeveralSourceProjects
                                       ? concatProjectsListFromCollection(projects.usable)
                                       : std::string());
    const auto& current = Session::Projects()->SetCurrentProject(std::move(project));
    auto& parameters = *Session::Parameters();
    parameters.ApplicationNameStr = RunData().NewTovimarProjectTitle();
    parameters.SetHelpProjectName(current.Name);
    parameters.SetHelpProjectTitle(parameters.ApplicationNameStr);
}

std::string CTovimarActions::concatProjectsListFromCollection(const KeyedList<std::string>& rcol) {
    std::vector<std::string> names;
    for (const std::string& name : rcol)
        names.push_back(name);
    return text::Join(names, "|");
}

/// The identifiers of a project outlive its being made anew; its catalogue entry comes back with the run's
/// save.
void CTovimarActions::TakeOverEarlierProject(CAddInProject& project) {
    earlierProjectFile_.clear();
    const std::string path = Session::Parameters()->FolderForGeneratedHelp() + project.Name + ".tvp";
    XmlDocument file;
    if (!FileExists(path) || !file.load(path))
        return;
    auto* listed = Session::Projects()->GetProjectDefinitionByTvpFullPath(path);
    const bool sameSource = listed != nullptr ? text::EqualsIgnoringCase(listed->SourceProjectFullPath,
                                                                         project.SourceProjectFullPath)
                                              : NamesSource(file, HostAgent().CurrentSourceProjectName());
    if (!sameSource)
        return;
    earlierProjectFile_ = project.Name + ".tvp";
    const XmlNode root = file.selectSingleNode("//Project");
    // A project file that was made again from its tree has none.
    const auto kept = [&](const char* name, const std::string& inCatalogue) {
        const std::string inFile = root.attribute(name);
        return inFile.empty() ? inCatalogue : inFile;
    };
    project.HUID = kept("HUID", listed == nullptr ? std::string() : listed->HUID);
    project.SUID = kept("SUID", listed == nullptr ? std::string() : listed->SUID);
    if (listed != nullptr) {
        listed->IsNew = true;
        Session::Projects()->RemoveTempProjects();
    }
}

CTovimarActions::Outcome CTovimarActions::GenerateFromOptions(bool checked) {
    auto outcome = Outcome::Refused;
    Trapped(kClass, "GenerateFromOptions", [&] {
        if (!checked) {
            const Hourglass hourglass;
            const HostMeter meter("Checking help generation options...", 2);
            if (CheckIfGenerationPossible() != kSuccess)
                return;
        }
        outcome = Outcome::Cancelled;
        TakeRunOptions();
        LoadTree();
        CompleteTree();
        outcome = RunGeneration();
    });
    EndRun(/*begun=*/true);
    return outcome;
}

void CTovimarActions::TakeRunOptions() {
    auto& parameters = *Session::Parameters();
    parameters.LastUsedFolderForGeneratedHelp = parameters.FolderForGeneratedHelp();
    parameters.LastUsedFolderForCapturedImages = parameters.FolderForGeneratedImages();
    parameters.HotSpots = parameters.AddHotSpotsForForm;
    parameters.NoReportsScreenShots = !parameters.AddImageForReport;
    Session::CurrentProject()->Folder = parameters.LastUsedFolderForGeneratedHelp;
}

/// A fresh tree whose groups follow the options; the wizard's user has set them in the tree itself.
void CTovimarActions::LoadTree() {
    auto& parameters = *Session::Parameters();
    auto& generator = *Session::Generator();
    // The web help's entry page is written last; one of an earlier run would count among the pages.
    const std::string entryPage = parameters.FolderForGeneratedHelp() + "main.htm";
    if (!earlierProjectFile_.empty() && FileExists(entryPage))
        platform::Env().files->DeleteFile(entryPage);
    generator.UnLoadTreviewForActiveProject();
    generator.LoadTreviewForActiveProject(/*vfSkipIfLoaded=*/true);
    if (auto* root = generator.HelpProjectTree().Root())
        SkipKindsThatAreOff(*root, parameters);
}

void CTovimarActions::CompleteTree() {
    auto& tree = Session::Generator()->HelpProjectTree();
    auto* root = tree.Root();
    if (root == nullptr)
        throw RaisedError(kFailure1, "The contents template of the installation can't be loaded", kClass);
    tree.SyncGenerateFlagsFromTree();
    if (auto* settings = Session::Settings())
        settings->CopyToOptions();
    if (root->HtmlTitle().empty())
        root->SetHtmlTitle(Session::Parameters()->HelpProjectTitle());
    RunData().HtmlHelp().CloseAll();
    HostAgent().HourglassOn();
    HostAgent().HideIDEWindows();
    platform::Env().doEvents();
}

CTovimarActions::Outcome CTovimarActions::RunGeneration() {
    auto& run = Session::Run();
    if (!run.generationInterrupted) {
        run.generationInProgress = true;
        RunData().GenerationStats().Reset();
        Session::Generator()->Generate();
        run.generationInProgress = false;
    }
    if (run.generationInterrupted) {
        HostAgent().ProgressMeterRemove();
        HostAgent().HourglassOffFinal();
        ShowMessage("Help generation was cancelled by end-user.", kMsgCritical, kApplicationTitle);
        return Outcome::Cancelled;
    }
    Session::Projects()->Save();
    ShowMessage(SummaryText(RunData().GenerationStats(), HostAgent().CurrentSourceProjectTypeName()),
                kMsgInformation, "Help Generation Completed", {}, 0,
                "CTovimarActions.ProcessWizardFormClosing");
    return Outcome::Completed;
}

/// A stopped run answers all commands without reaching the host: meter and pointer only go now.
void CTovimarActions::EndRun(bool begun) {
    auto& run = Session::Run();
    run.generationInProgress = false;
    run.generationInterrupted = false;
    PassOver([begun] {
        if (begun) {
            HostAgent().ResetIDEWindows();
            HostAgent().ProgressMeterRemove();
        }
        HostAgent().HourglassOffFinal();
    });
}

std::string CTovimarActions::SummaryText(const CTovimarStats& stats,
                                         const std::string& sourceProjectTypeName) {
    const auto is = [&](const char* kind) { return text::EqualsIgnoringCase(sourceProjectTypeName, kind); };
    std::vector<std::string> lines{"The Tovimar added:",
                                   std::to_string(stats.HelpPagesQty) + " new help pages with " +
                                       std::to_string(stats.HelpPagesQty + stats.ControlSectionsQty) +
                                       " sections,",
                                   std::to_string(stats.ScreenshotsQty) + " screenshots,"};
    const auto addIfAny = [&](std::int32_t quantity, const char* words) {
        if (quantity > 0)
            lines.push_back(std::to_string(quantity) + words);
    };
    const bool access = is(SourceProjectKind::kMSAccess);
    if (access || is(SourceProjectKind::kVB6))
        addIfAny(stats.FormHelpContextIdsQty, " updated helpcontextids in forms,");
    else if (!is(SourceProjectKind::kAspNet))
        addIfAny(stats.HelpProvidersQty, " HelpProviders in forms,");
    if (access)
        addIfAny(stats.ReportHelpContextIdsQty, " updated helpcontextids in reports,");
    lines.push_back(std::to_string(stats.IndexEntriesQty) + " index entries in generated help.");
    return text::Join(lines, "\r\n");
}

} // namespace tovimar
