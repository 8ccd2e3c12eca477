/// A help project that is made before its pages are.
#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarActions.h"
#include "project/CHelpPrjTree.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarActions";

/// The paths of the project follow the options, as in a generation.
void PlaceProject(CAddInProject& project, const CTovimarParameters& parameters) {
    project.Name = parameters.HelpProjectName();
    project.FileName = project.Name;
    project.Folder = parameters.FolderForGeneratedHelp();
    project.PicsSubfolderName = parameters.NameOfFolderForGeneratedImages();
}

} // namespace

CTovimarActions::Outcome CTovimarActions::CreateFromOptions() {
    auto outcome = Outcome::Cancelled;
    Trapped(kClass, "CreateFromOptions", [&] {
        TakeRunOptions();
        LoadTree();
        CompleteTree();
        if (Session::Run().generationInterrupted)
            return;
        auto& projects = *Session::Projects();
        PlaceProject(*projects.CurrentProject(), *Session::Parameters());
        projects.Save(projects.ListCurrentProject()->TvpFullPath());
        auto& tree = Session::Generator()->HelpProjectTree();
        tree.WasChanged = false;
        tree.NewHtmlHelpProject = false;
        outcome = Outcome::Completed;
    });
    EndRun(/*begun=*/true);
    return outcome;
}

} // namespace tovimar
