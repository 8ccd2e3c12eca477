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
#include "generation/CTovimarCompiler.h"
#include "generation/CTovimarParameters.h"
#include "generation/CTovimarStats.h"
#include "generation/HelpUtilities.h"
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

/// A compiled help doesn't open from a folder with these characters.
bool UserWantsOtherFolder(const std::string& folder) {
    const char* character = folder.find('%') != std::string::npos   ? "%"
                            : folder.find('#') != std::string::npos ? "#"
                                                                    : nullptr;
    if (character == nullptr)
        return false;
    const std::string question =
        "Target folder '" + folder + "' contains character '" + character +
        "'\r\nA help file (.chm) will not work correctly in folders with that character.\r\n"
        "Do you want to select another target folder?";
    return ShowMessage(question, kMsgYesNo | kMsgQuestion | kMsgDefaultSecond, kApplicationTitle) ==
           platform::kAnswerYes;
}

bool UserStopsOverLockedHelp() {
    CTovimarCompiler compiler;
    if (compiler.TestHelpFileWritable())
        return false;
    const std::string question = "Can't copy over existing help file " + compiler.GetCopiedHelpFullPath() +
                                 "\r\nClose it if it's opened in HTML Help window,\r\n"
                                 "then click [OK] button to continue help generation or\r\n"
                                 "click [Cancel] button to stop help generation.";
    return ShowMessage(question, kMsgOkCancel | kMsgExclamation, kApplicationTitle) ==
           platform::kAnswerCancel;
}

bool NameIsTaken(const std::string& name) {
    auto* project = Session::Projects()->ProjectExists(name + ".tvp");
    if (project == nullptr || project->IsNew || !FileExists(project->TvpFullPath()))
        return false;
    ShowMessage("Tovimar project already exists '" + name + "'.\r\nPlease enter another project name.",
                kMsgOk, kApplicationTitle);
    return true;
}

} // namespace

bool CTovimarActions::PrepareProject(const GenerationRequest& request) {
    bool prepared = false;
    Trapped(kClass, "OpenWizardForm", [&] {
        std::string name;
        std::string usable;
        int count = 0;
        if (!FindSourceProjects(name, usable, count))
            return;
        auto& catalogue = *Session::Projects();
        catalogue.RemoveTempProjects();
        auto project = std::make_unique<CAddInProject>();
        project->Name = request.projectName.empty() ? name : request.projectName;
        project->SourceProjectFullPath = HostAgent().CurrentSourceProjectFullPath();
        if (project->SourceProjectFullPath.empty()) {
            WarningDialog("Can't get unique help project name for source project '" + name + "'.");
            return;
        }
        project->HasSeveralSourceProjects = count > 1;
        project->SetSourceProjectsList(count > 1 ? usable : std::string());

        auto& parameters = *Session::Parameters();
        parameters.SetFolderForGeneratedHelp(request.folder);
        TakeOverEarlierProject(*project);
        catalogue.SetCurrentProject(std::move(project));
        parameters.ApplicationNameStr =
            request.application.empty() ? RunData().NewTovimarProjectTitle() : request.application;
        parameters.SetHelpProjectName(catalogue.CurrentProject()->Name);
        parameters.SetHelpProjectTitle(request.title.empty() ? parameters.ApplicationNameStr : request.title);
        prepared = true;
    });
    return prepared;
}

bool CTovimarActions::FindSourceProjects(std::string& name, std::string& usable, int& count) {
    auto& host = HostAgent();
    const auto list = host.GetSourceProjectsList();
    if (list.Empty()) {
        ShowMessage("No Projects!", kMsgExclamation, kApplicationTitle, {}, 0,
                    "CTovimarActions.OpenWizardForm");
        return false;
    }
    name = host.CurrentSourceProjectName();
    std::vector<std::string> names;
    for (const std::string& listed : list)
        names.push_back(listed);
    if (std::none_of(names.begin(), names.end(),
                     [&](const std::string& listed) { return text::EqualsIgnoringCase(listed, name); })) {
        WarningDialog("Source project '" + name +
                      "' not found in the list of available source projects:\r\n" + text::Join(names, "|"));
        return false;
    }
    std::vector<std::string> found;
    for (const std::string& listed : names) {
        host.SetCurrentSourceProject(listed);
        const std::string path = host.CurrentSourceProjectFullPath();
        TraceText([&] {
            return "Name = " + listed + ", Type = " + host.CurrentSourceProjectTypeName() +
                   ", FullPath = " + path;
        });
        if (!path.empty())
            found.push_back(listed);
    }
    host.SetCurrentSourceProject(name);
    usable = text::Join(found, "|");
    count = static_cast<int>(found.size());
    return true;
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
    project.HUID = root.attribute("HUID");
    project.SUID = root.attribute("SUID");
    if (listed != nullptr) {
        listed->IsNew = true;
        Session::Projects()->RemoveTempProjects();
    }
}

ResultCode CTovimarActions::CheckIfGenerationPossible() {
    auto& files = *platform::Env().files;
    const std::string folder = Session::Parameters()->FolderForGeneratedHelp();
    const std::string target = "Target folder '" + folder + "'\r\n";
    if (UserWantsOtherFolder(folder))
        return kOtherFolder;
    if (files.FolderExists(folder))
        for (const std::string& file : files.ListFiles(folder, "*.tvp"))
            if (!text::EqualsIgnoringCase(file, earlierProjectFile_)) {
                WarningDialog(target + "already has Tovimar project '" + file +
                              "'.\r\n\r\nPlease select another target folder.");
                return kOtherFolder;
            }
    if (!CreateFolderPath(folder)) {
        WarningDialog(target + " cannot be created.\r\nPlease select or enter another target folder name.");
        return kNoFolder;
    }
    if (!TestFolderWritable(folder)) {
        WarningDialog(target + " is no write access.\r\nPlease select or enter another target folder name.");
        return kNoWriteAccess;
    }
    if (NameIsTaken(Session::Parameters()->HelpProjectName()))
        return kNameTaken;
    return UserStopsOverLockedHelp() ? kHelpFileLocked : kSuccess;
}

CTovimarActions::Outcome CTovimarActions::GenerateFromOptions() {
    auto outcome = Outcome::Refused;
    Trapped(kClass, "ProcessWizardFormClosing", [&] {
        {
            const Hourglass hourglass;
            const HostMeter meter("Checking help generation options...", 2);
            if (CheckIfGenerationPossible() != kSuccess)
                return;
        }
        outcome = Outcome::Cancelled;
        LoadTree();
        outcome = RunGeneration();
    });
    // A stopped run answers all commands without reaching the host: meter and pointer only go now.
    auto& run = Session::Run();
    run.generationInProgress = false;
    run.generationInterrupted = false;
    PassOver([] {
        HostAgent().ResetIDEWindows();
        HostAgent().ProgressMeterRemove();
        HostAgent().HourglassOffFinal();
    });
    return outcome;
}

void CTovimarActions::LoadTree() {
    auto& parameters = *Session::Parameters();
    auto& generator = *Session::Generator();
    parameters.LastUsedFolderForGeneratedHelp = parameters.FolderForGeneratedHelp();
    parameters.LastUsedFolderForCapturedImages = parameters.FolderForGeneratedImages();
    parameters.HotSpots = parameters.AddHotSpotsForForm;
    parameters.NoReportsScreenShots = !parameters.AddImageForReport;
    Session::CurrentProject()->Folder = parameters.LastUsedFolderForGeneratedHelp;

    // The web help's entry page is written last; one of an earlier run would count among the pages.
    const std::string entryPage = parameters.FolderForGeneratedHelp() + "main.htm";
    if (!earlierProjectFile_.empty() && FileExists(entryPage))
        platform::Env().files->DeleteFile(entryPage);
    generator.UnLoadTreviewForActiveProject();
    generator.LoadTreviewForActiveProject(/*vfSkipIfLoaded=*/true);
    auto* root = generator.HelpProjectTree().Root();
    if (root == nullptr)
        throw RaisedError(kFailure1, "The contents template of the installation can't be loaded", kClass);
    SkipKindsThatAreOff(*root, parameters);
    generator.HelpProjectTree().SyncGenerateFlagsFromTree();
    if (auto* settings = Session::Settings())
        settings->CopyToOptions();
    if (root->HtmlTitle().empty())
        root->SetHtmlTitle(parameters.HelpProjectTitle());
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
        ShowMessage("Help generation was cancelled by end-user.", kMsgCritical, kApplicationTitle);
        return Outcome::Cancelled;
    }
    Session::Projects()->Save();
    ShowMessage(SummaryText(RunData().GenerationStats(), HostAgent().CurrentSourceProjectTypeName()),
                kMsgInformation, "Help Generation Completed", {}, 0,
                "CTovimarActions.ProcessWizardFormClosing");
    return Outcome::Completed;
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
