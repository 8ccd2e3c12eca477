#include "generation/CTovimarCompiler.h"

#include "foundation/CAddInProject.h"
#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarParameters.h"
#include "generation/HelpUtilities.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarCompiler";

std::string FolderOfCopiedHelp() {
    const auto* parameters = Session::Parameters();
    if (!parameters->FolderForCopiedHelp.empty())
        return platform::WithTrailingBackslash(parameters->FolderForCopiedHelp);
    return platform::FolderOf(HostAgent().CurrentSourceProjectFullPath());
}

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

void RunCompiler(const CAddInProject& project) {
    const std::string projectFile = platform::Join(project.Folder, project.Name + ".hhp");
    const std::string commandLine = "\"" + GetHtmlHelpWorkshopExePath() + "hhc.exe\" \"" + projectFile + "\"";
    auto* generator = Session::Generator();
    if (generator != nullptr && generator->CompilerStarted)
        generator->CompilerStarted();
    platform::Processes::Outcome outcome;
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
    }
}

} // namespace

bool CTovimarCompiler::CompileHtmlHelp() {
    Trapped(kClass, "CompileHtmlHelp", [&] {
        const auto* project = Session::CurrentProject();
        platform::Env().doEvents();
        if (project != nullptr && Session::Parameters()->CompileHTMLHelp && Session::Server() != nullptr &&
            Session::Server()->HtmlWorkshopInstalled())
            RunCompiler(*project);
    });
    return true;
}

std::string CTovimarCompiler::GetCopiedHelpFullPath() const {
    return FolderOfCopiedHelp() + platform::BaseNameOf(Session::Parameters()->CompiledHelpFullPath()) +
           ".chm";
}

bool CTovimarCompiler::CopyCompiledHelp() {
    const ResultCode result = Trapped(kClass, "CopyCompiledHelp", [&] {
        const std::string compiled = Session::Parameters()->CompiledHelpFullPath();
        const std::string copied = GetCopiedHelpFullPath();
        // The help project may lie beside the source itself.
        if (platform::Env().files->FileExists(compiled) && !text::EqualsIgnoringCase(compiled, copied))
            platform::Env().files->CopyFile(compiled, copied);
    });
    return result == kSuccess;
}

bool CTovimarCompiler::TestHelpFileWritable() {
    auto& files = *platform::Env().files;
    const std::string copied = GetCopiedHelpFullPath();
    if (!files.FileExists(copied))
        return true;
    const std::string temporary = FolderOfCopiedHelp() + "~" + platform::BaseNameOf(copied) + ".tmp";
    bool writable = false;
    PassOver([&] {
        files.CopyFile(copied, temporary);
        files.CopyFile(temporary, copied);
        writable = true;
    });
    PassOver([&] { files.DeleteFile(temporary); });
    return writable;
}

} // namespace tovimar
