#include "cli/Commands.h"
#include "cli/HelpFiles.h"
#include "cli/ProjectSource.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarCompiler.h"
#include "generation/FolderOperations.h"
#include "generation/OpenHelp.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"

namespace tovimar::cli {
namespace {

/// One command run: the steps in order, each stops the run by raising.
class Recompilation {
public:
    Recompilation(const Arguments& arguments, Surroundings& surroundings)
        : arguments_(arguments), surroundings_(surroundings), source_(arguments, surroundings) {}

    int Run() {
        surroundings_.Boxes().warningsStop = true;
        source_.Open();
        RunData().LoadSettings();
        LoadProject();
        CheckCompiler();
        if (const std::string complaint = CopyComplaint(arguments_); !complaint.empty())
            throw Stop{complaint};
        return Make();
    }

private:
    void LoadProject();
    int Make();
    void Show() const;

    const Arguments& arguments_;
    Surroundings& surroundings_;
    ProjectSource source_;
};

void Recompilation::LoadProject() {
    // Whatever is wrong has been told by then.
    if (TheServer().ReloadTovimarProject(source_.ProjectFile()) != kSuccess)
        throw Stop{surroundings_.Boxes().errors > 0
                       ? std::string()
                       : "the project '" + source_.ProjectFile() + "' can't be loaded"};
    StopIfInterrupted();
    if (!platform::Env().files->FileExists(Session::CurrentProject()->HHCFullPath()))
        throw Stop{"the help of '" + source_.ProjectFile() +
                   "' wasn't generated yet\n\"tovimar generate\" writes its pages."};
    if (const std::string& folder = Session::CurrentProject()->Folder; !TestFolderWritable(folder))
        throw Stop{"no write access to '" + folder + "'"};
    auto& parameters = *Session::Parameters();
    parameters.CompileHTMLHelp = arguments_.compile;
    if (!arguments_.copyTo.empty())
        parameters.FolderForCopiedHelp = platform::Env().files->FromNative(FullPath(arguments_.copyTo));
}

int Recompilation::Make() {
    surroundings_.Progress().Phase(arguments_.compile ? "Compiling help" : "Writing web help");
    CTovimarCompiler().RecompileHelpProject(/*vfSkipOpeningOfRecompiledHelp=*/true,
                                            /*vfSkipCHMCompilation=*/!arguments_.compile);
    surroundings_.Progress().Clear();
    StopIfInterrupted();
    const bool compiled = CompilerSucceeded(arguments_.verbose);
    ShowCompiledHelp();
    ShowWebHelpAndProject();
    if (!compiled || surroundings_.Boxes().errors > 0 || Session::Run().runErrorCount != 0)
        return kFailed;
    // One that came from elsewhere is known from now on.
    Session::Projects()->Save();
    if (arguments_.open)
        Show();
    return kDone;
}

void Recompilation::Show() const {
    if (arguments_.compile)
        OpenHelp(/*vfSkipStaleCheck=*/true);
    else
        OpenWebHelp(/*vfSkipStaleCheck=*/true);
}

} // namespace

int Recompile(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Recompilation(arguments, surroundings).Run(); });
}

} // namespace tovimar::cli
