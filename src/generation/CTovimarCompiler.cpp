#include "generation/CTovimarCompiler.h"

#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "generation/HelpCompiler.h"
#include "generation/HelpUtilities.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "project/CHelpPrjTreeNode.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarCompiler";

} // namespace

CTovimarCompiler::CTovimarCompiler() = default;
CTovimarCompiler::~CTovimarCompiler() = default;

bool CTovimarCompiler::CompileHtmlHelp() {
    Trapped(kClass, "CompileHtmlHelp", [&] {
        const auto* project = Session::CurrentProject();
        platform::Env().doEvents();
        if (project != nullptr && Session::Parameters()->CompileHTMLHelp && Session::Server() != nullptr &&
            Session::Server()->HtmlWorkshopInstalled())
            RunHelpCompiler(HelpCompilerCommandLine(platform::Join(project->Folder, project->Name + ".hhp")),
                            *project);
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
        if (platform::Env().files->FileExists(compiled))
            CopyOver(compiled, GetCopiedHelpFullPath());
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
