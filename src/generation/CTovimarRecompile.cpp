/// The help of a project that exists, made again without asking the host for its objects.
#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarCompiler.h"
#include "generation/FolderOperations.h"
#include "generation/HelpCompiler.h"
#include "generation/HelpUtilities.h"
#include "generation/OpenHelp.h"
#include "generation/RunProgress.h"
#include "generation/clsHtmlHelp.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/Interrupt.h"
#include "platform/files/Paths.h"
#include "project/CHelpPrjTree.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarCompiler";

/// The compiler's own complaints are its own; only its not starting is a failure here.
void StartCompiler(const std::string& projectFile, const CAddInProject& project) {
    const std::string commandLine = HelpCompilerCommandLine(projectFile);
    try {
        RunHelpCompiler(commandLine, project);
    } catch (const RaisedError& failure) {
        if (platform::InterruptRequested())
            throw;
        throw RaisedError(
            kFailure2,
            "Cannot recompile help.\r\nPlease check that help file is closed and try again.\r\n\r\n"
            "Command line: \r\n" +
                commandLine + "\r\n\r\nReturn value: " + std::to_string(failure.Number()),
            "CTovimarCompiler.RecompileHelpProject1");
    }
}

/// True when the project file can be compiled; the user is told what is missing otherwise.
bool CanCompile(const std::string& projectFile) {
    std::string missing;
    if (GetHtmlHelpWorkshopExePath().empty())
        missing = "HTML help workshop is not installed.";
    else if (projectFile.empty())
        missing = "HTML help project was not generated.";
    else if (!platform::Env().files->FileExists(projectFile))
        missing = "HTML help project doesn't exist '" + projectFile + "'.";
    if (missing.empty())
        return true;
    RunData().ProgressBarDispose();
    WarningDialog(missing);
    return false;
}

void TellResult(const std::string& projectFile, bool skipOpening) {
    const std::string head = "Recompiling of the HTML help project\r\n\r\n'" + projectFile + "' ";
    if (Session::Run().runErrorCount != 0) {
        WarningDialog(head + "failed.");
        return;
    }
    if (!skipOpening &&
        ShowMessage(head + "succeeded.\r\n\r\nWould you like to open recompiled HTML help file?", kMsgYesNo,
                    kApplicationTitle) == platform::kAnswerYes)
        OpenHelp(/*vfSkipStaleCheck=*/true);
}

} // namespace

ResultCode CTovimarCompiler::RecompileHelpProject(bool vfSkipOpeningOfRecompiledHelp,
                                                  bool vfSkipCHMCompilation) {
    return RecompileHelpProject1(vfSkipOpeningOfRecompiledHelp, vfSkipCHMCompilation);
}

ResultCode CTovimarCompiler::RecompileHelpProject1(bool vfSkipOpeningOfRecompiledHelp,
                                                   bool vfSkipCHMCompilation) {
    ResultCode result = kSuccess;
    Trapped(kClass, "RecompileHelpProject1", [&] {
        if (!RunData().IsMSAccessDbOpened()) {
            result = kFailure1;
            return;
        }
        const Hourglass hourglass;
        Session::Run().runErrorCount = 0;
        if (auto* project = Session::CurrentProject())
            WriteProjectFiles(*project);
        if (!vfSkipCHMCompilation && !Session::Run().generationInterrupted)
            CompileAgain(vfSkipOpeningOfRecompiledHelp);
    });
    PassOver([] { RunData().ProgressBarDispose(); });
    return result;
}

void CTovimarCompiler::WriteProjectFiles(CAddInProject& project) {
    auto& generator = RunData().Generator();
    generator.CompilerOutput.clear();
    generator.CompilerExitCode = 0;
    RunData().ProgressBarInit("Starting recompile...", 6);
    for (const auto& folder : {project.Folder, project.PicsSubfolderPath(), project.XmlFormsFolder()})
        RemoveUnfinishedFiles(folder);
    // Saving an empty tree would cost the project.
    if (generator.HelpProjectTree().Root() == nullptr)
        generator.LoadTreviewForActiveProject();
    auto& tree = generator.HelpProjectTree();
    const DefinitionCache::Holder definitions(tree.Definitions());
    RunData().ProgressBarUpdate("Refreshing and saving control definitions...", 1);
    tree.SaveXml(project.TvpFullPath(), /*vfSkipSerializers=*/false);
    RunData().ProgressBarUpdate("Refreshing and saving TOC ...", 2);
    generator.CreateHHPAndRelatedFiles(project.HHPFullPath());
    tree.SaveHHC(project.HHCFullPath(), /*vfForceContentsRebuild=*/true);
    RunData().ProgressBarUpdate("Refreshing and saving HTML help index ...", 3);
    tree.MakeAndSaveHHK(project.HHKFullPath());
    RunData().ProgressBarUpdate("Generating Java help...", 3);
    tree.MakeJavaHelp(project);
    tree.SaveCheckSums(/*vfSaveCurrentCheckSum=*/true);
    tree.WasChanged = false;
    tree.NewHtmlHelpProject = false;
}

void CTovimarCompiler::CompileAgain(bool skipOpening) {
    const auto* project = Session::CurrentProject();
    const std::string projectFile = project == nullptr ? std::string() : project->HHPFullPath();
    if (!CanCompile(projectFile))
        return;
    // An open help window would lock the file.
    RunData().HtmlHelp().CloseAll();
    platform::Env().doEvents();
    RunData().ProgressBarUpdate("Running HTML help compiler...", 4);
    StartCompiler(projectFile, *project);
    RunData().ProgressBarUpdate("Copying recompiled HTML help...", 5);
    if (const std::string compiled = project->CHMFullPath(); platform::Env().files->FileExists(compiled))
        CopyOver(compiled, FolderOfCopiedHelp() + platform::FileNameOf(compiled));
    RunData().ProgressBarDispose();
    TellResult(projectFile, skipOpening);
}

} // namespace tovimar
