/// What must hold before a generation may begin.
#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarCompiler.h"
#include "generation/CTovimarParameters.h"
#include "generation/HelpUtilities.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"

namespace tovimar {
namespace {

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
    if (project == nullptr || project->IsNew || !platform::Env().files->FileExists(project->TvpFullPath()))
        return false;
    ShowMessage("Tovimar project already exists '" + name + "'.\r\nPlease enter another project name.",
                kMsgOk, kApplicationTitle);
    return true;
}

} // namespace

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
    if (UserStopsOverLockedHelp())
        return kHelpFileLocked;
    Session::Generator()->HelpProjectTree().NewHtmlHelpProject = true;
    return kSuccess;
}

} // namespace tovimar
