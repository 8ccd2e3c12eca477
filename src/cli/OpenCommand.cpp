#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/ProjectFile.h"
#include "cli/ProjectReading.h"
#include "cli/ProjectSource.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/FolderOperations.h"
#include "generation/OpenHelp.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"

namespace tovimar::cli {
namespace {

bool IsStale(const Arguments& arguments, const std::string& projectFile) {
    const std::string base = platform::FolderOf(projectFile) + platform::BaseNameOf(projectFile);
    return arguments.what == "web" ? IsWebHelpStale(platform::FolderOf(projectFile) + "main.htm")
                                   : IsHelpStale(base + ".chm");
}

/// As it stands: there is nothing to ask, or nobody to renew it.
void ShowAsItStands(const Arguments& arguments, const std::string& projectFile) {
    const ProjectReading reading(projectFile);
    if (arguments.what == "web")
        OpenWebHelp(/*vfSkipStaleCheck=*/true);
    else
        OpenHelp(/*vfSkipStaleCheck=*/true);
}

/// Renewing a help needs its application. False, after a warning, when that can't be had.
bool OpenSource(ProjectSource& source, Surroundings& surroundings) {
    std::string reason;
    try {
        source.Open();
        return true;
    } catch (const Stop& stop) {
        if (stop.exitCode == kInterrupted)
            throw;
        reason = stop.message;
    } catch (const RaisedError& failure) {
        reason = failure.what();
    }
    surroundings.Progress().Clear();
    PrintWarning(NativePathsInText("the help is older than the project and can't be renewed: " + reason));
    return false;
}

void ShowAfterAsking(const Arguments& arguments, const ProjectSource& source) {
    RunData().LoadSettings();
    if (TheServer().ReloadTovimarProject(source.ProjectFile()) != kSuccess)
        throw Stop{"the project '" + source.ProjectFile() + "' can't be loaded"};
    TheServer().TestThatHtmlWorkshopInstalled();
    if (arguments.what == "web")
        TheServer().OpenWebHelpOfActiveProject();
    else
        TheServer().OpenHelpOfActiveProject();
}

int Show(const Arguments& arguments, Surroundings& surroundings) {
    surroundings.Boxes().warningsStop = true;
    ProjectSource source(arguments, surroundings);
    if (arguments.what == "folder")
        ShellExecute(platform::FolderOf(source.ProjectFile()), "open", {}, /*vfWait=*/false);
    else if (IsStale(arguments, source.ProjectFile()) && OpenSource(source, surroundings))
        ShowAfterAsking(arguments, source);
    else
        ShowAsItStands(arguments, source.ProjectFile());
    surroundings.Progress().Clear();
    StopIfInterrupted();
    return surroundings.Boxes().errors > 0 || Session::Run().runErrorCount != 0 ? kFailed : kDone;
}

} // namespace

int Open(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Show(arguments, surroundings); });
}

} // namespace tovimar::cli
