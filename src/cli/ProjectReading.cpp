#include "cli/ProjectReading.h"

#include "cli/Stop.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Session.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimarParameters.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"
#include "platform/files/Paths.h"

#include <memory>

namespace tovimar::cli {
namespace {

CAddInProject& MakeCurrent(const std::string& file) {
    auto& catalogue = *Session::Projects();
    if (auto* known = catalogue.GetProjectDefinitionByTvpFullPath(file)) {
        catalogue.SetCurrentProject(known);
        return *known;
    }
    auto project = std::make_unique<CAddInProject>();
    project->Name = project->FileName = platform::BaseNameOf(file);
    project->Folder = platform::WithoutTrailingBackslash(platform::FolderOf(file));
    project->PicsSubfolderName = Session::Parameters()->NameOfFolderForGeneratedImagesWithSlash();
    return catalogue.SetCurrentProject(std::move(project));
}

} // namespace

ProjectReading::ProjectReading(const std::string& projectFile) {
    RegisterSettingsLoader();
    TheServer().Connect();
    RunData().LoadSettings();
    if (RunData().ReLoadSettings(projectFile, /*vfLoadSettingsFromTvpFile=*/true) != kSuccess)
        throw Stop{"the options of '" + projectFile + "' can't be read"};
    const CAddInProject& project = MakeCurrent(projectFile);
    Session::Parameters()->SetFolderForGeneratedHelp(platform::WithTrailingBackslash(project.Folder));
}

ProjectReading::~ProjectReading() {
    TheServer().Disconnect();
    ForgetServer();
}

} // namespace tovimar::cli
