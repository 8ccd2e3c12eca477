#include "generation/CHelpPrjSelector.h"

#include "foundation/CAddInProjects.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CHelpPrjSelector";

/// The catalogue of the session; a connection without one has no projects.
CAddInProjects& Catalogue() {
    if (CAddInProjects* projects = Session::Projects())
        return *projects;
    throw RaisedError(kGeneralFailure, "The projects' catalogue isn't loaded", kClass);
}

/// What a project file tells of itself. Null, with the failure in `result`, when it doesn't load.
std::unique_ptr<CAddInProject> ReadProject(const std::string& path, bool external, ResultCode& result) {
    CHelpPrjTree tree;
    result = tree.Load(path, /*vfNewHtmlHelpProject=*/true, external, /*vstrXml=*/{},
                       /*vfLoadControls=*/true);
    if (result == kSuccess && tree.Root() == nullptr)
        result = kGeneralFailure;
    if (result != kSuccess)
        return nullptr;
    auto project = std::make_unique<CAddInProject>();
    project->Name = tree.Root()->Name();
    project->SetTitle(tree.Root()->HtmlTitle());
    project->FileName = platform::BaseNameOf(path);
    project->Folder = platform::FolderOf(path);
    project->PicsSubfolderName = tree.Root()->PicsSubfolderName();
    tree.Terminate();
    return project;
}

/// Lists a project file that was opened from elsewhere; null as above.
CAddInProject* ListProject(const std::string& path, bool external, ResultCode& result) {
    auto& catalogue = Catalogue();
    catalogue.SetCurrentProject(nullptr);
    auto project = ReadProject(path, external, result);
    if (project == nullptr)
        return nullptr;
    project->SourceProjectFullPath = Session::Context().CurrentSourceProjectFullPath();
    project->IsNew = false;
    return &catalogue.Add(std::move(project));
}

/// The open project must not be lost when another takes its place: it stays open when it can't be saved.
ResultCode SaveAndCloseOpenTree() {
    auto* tree = Session::HelpProjectTree();
    if (tree == nullptr || tree->Root() == nullptr)
        return kSuccess;
    if (const ResultCode saved = Catalogue().SaveCurrentProject(); saved != kSuccess)
        return saved;
    if (auto* generator = Session::Generator())
        generator->UnLoadTreviewForActiveProject();
    else
        tree->Terminate();
    return kSuccess;
}

ResultCode MakeCurrent(const std::string& path, bool external, bool setTree) {
    // Before the catalogue forgets which project the tree belongs to.
    ResultCode result = SaveAndCloseOpenTree();
    if (result != kSuccess)
        return result;
    auto* project = Catalogue().GetProjectDefinitionByTvpFullPath(path);
    if (project == nullptr)
        project = ListProject(path, external, result);
    if (project == nullptr)
        return result;
    Catalogue().SetCurrentProject(project);
    auto* generator = Session::Generator();
    return setTree && generator != nullptr ? generator->LoadTreviewForActiveProject() : kSuccess;
}

} // namespace

ResultCode CHelpPrjSelector::Init() {
    return Trapped(kClass, "Init", [&] { existing_ = Catalogue().CurrentSourceProjectTvpProjects(); });
}

void CHelpPrjSelector::Terminate() {
    existing_.clear();
}

ResultCode CHelpPrjSelector::SetCurrent(const std::string& vstrProjectDefFullPath,
                                        bool vfLoadingExternalProject, bool vfSetHelpTreeObject) {
    ResultCode result = kGeneralFailure;
    const ResultCode trapped = Trapped(
        kClass, "SetCurrent",
        [&] {
            std::string path = vstrProjectDefFullPath;
            if (path.empty()) {
                const auto projects = Catalogue().CurrentSourceProjectTvpProjects();
                if (projects.empty())
                    return;
                path = projects.front();
            }
            if (!platform::Env().files->FileExists(path))
                UserWarningMessage("Help project file doesn't exist: " + path);
            else
                result = MakeCurrent(path, vfLoadingExternalProject, vfSetHelpTreeObject);
        },
        [&] { return "File = " + vstrProjectDefFullPath; });
    return trapped != kSuccess ? trapped : result;
}

} // namespace tovimar
