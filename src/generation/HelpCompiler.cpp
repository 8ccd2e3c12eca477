#include "generation/HelpCompiler.h"

#include "foundation/CAddInProject.h"
#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarParameters.h"
#include "generation/HelpUtilities.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <cmath>

namespace tovimar {
namespace {

constexpr double kSecondsOfDay = 86400;

/// What a compiler leaves that was ended in its work: a file that is cut and its working copy of the project.
void RemoveLeavings(const CAddInProject& project) {
    auto& files = *platform::Env().files;
    PassOver([&] {
        for (const std::string& copy : files.ListFiles(project.Folder, "~hhc*.hhp"))
            files.DeleteFile(platform::Join(project.Folder, copy));
        if (files.FileExists(project.CHMFullPath()))
            files.DeleteFile(project.CHMFullPath());
    });
}

} // namespace

std::string HelpCompilerCommandLine(const std::string& projectFile) {
    return "\"" + GetHtmlHelpWorkshopExePath() + "hhc.exe\" \"" + projectFile + "\"";
}

void RunHelpCompiler(const std::string& commandLine, const CAddInProject& project) {
    auto* generator = Session::Generator();
    if (generator != nullptr && generator->CompilerStarted)
        generator->CompilerStarted();
    platform::Processes::Outcome outcome;
    const double start = platform::Env().clock->Timer();
    try {
        outcome = platform::Env().processes->RunAndWait(commandLine);
    } catch (const RaisedError&) {
        RemoveLeavings(project);
        throw;
    }
    Session::TraceLog()->addMessage("hhc.exe: " + outcome.output);
    if (generator != nullptr) {
        generator->CompilerOutput = outcome.output;
        generator->CompilerExitCode = outcome.exitCode;
        // The timer starts again at midnight.
        generator->CompilerSeconds =
            std::fmod(platform::Env().clock->Timer() - start + kSecondsOfDay, kSecondsOfDay);
    }
}

std::string FolderOfCopiedHelp() {
    const auto* parameters = Session::Parameters();
    if (!parameters->FolderForCopiedHelp.empty())
        return platform::WithTrailingBackslash(parameters->FolderForCopiedHelp);
    return platform::FolderOf(HostAgent().CurrentSourceProjectFullPath());
}

// The help project may lie beside the source itself.
void CopyOver(const std::string& file, const std::string& target) {
    if (!text::EqualsIgnoringCase(file, target))
        platform::Env().files->CopyFile(file, target);
}

} // namespace tovimar
