#pragma once

#include "platform/Error.h"
#include "platform/KeyedList.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

namespace tovimar {

class CAddInProject;
class CTovimarStats;
class IHelpWizardForm;
class clsScreenshotOptions;

/// What a caller of a generation decides beside the options. Empty fields take the source project's.
struct GenerationRequest {
    std::string folder; ///< Windows path of the help project's folder
    std::string projectName;
    std::string title;
    std::string application;
};

/// The user-level actions: check, ask, show, and call the machinery. A generation has two roads: the wizard,
/// and `PrepareProject` with `GenerateFromOptions` for a program that asks nobody. Failures are reported
/// under the class's name and end the action; what is missing is told in a warning.
class CTovimarActions {
public:
    CTovimarActions();
    ~CTovimarActions();
    CTovimarActions(const CTovimarActions&) = delete;
    CTovimarActions& operator=(const CTovimarActions&) = delete;

    void Init();
    /// Once: ends an open wizard and drops the screenshot options.
    void Terminate();

    /// Why a generation can't start; 0 means it can.
    static constexpr ResultCode kOtherFolder = MakeResultCode(0x80040065U);
    static constexpr ResultCode kNameTaken = MakeResultCode(0x80040066U);
    static constexpr ResultCode kNoFolder = MakeResultCode(0x80040067U);
    static constexpr ResultCode kHelpFileLocked = MakeResultCode(0x80040068U);
    static constexpr ResultCode kNoWriteAccess = MakeResultCode(0x80040069U);

    // With the wizard. Nothing opens in a program that has none.
    /// Opens the wizard on a new, temporary help project of the source project at hand.
    void OpenNewProject();
    /// The wizard was closed: with Finish the options are checked and saved, and the help is generated. Not
    /// 0: the wizard stands again, for the user to change what the code says.
    ResultCode ProcessWizardFormClosing(IHelpWizardForm& wizard);
    void CloseWizardFormOnDisconnection();
    /// Makes the wizard; set by a program with windows.
    std::function<std::unique_ptr<IHelpWizardForm>()> MakeWizardForm;

    // Without the wizard.
    /// Makes a help project of the source project at hand the current one and points the parameters at it. An
    /// earlier project of the same source and name in the folder is made anew under its own identifiers.
    /// False after a warning.
    bool PrepareProject(const GenerationRequest& request);
    /// Tests folder, name and help file; tells what is wrong. Makes the folder.
    ResultCode CheckIfGenerationPossible();
    enum class Outcome { Completed, Refused, Cancelled };
    /// Checks, loads the tree, generates, saves the catalogue and shows the result. Reported failures stand
    /// in the run's error count, also behind a completed run. `checked`: `CheckIfGenerationPossible` has just
    /// let it pass, and its questions aren't asked again.
    Outcome GenerateFromOptions(bool checked = false);
    /// The project alone: the tree of the source's objects is made and saved with the options, and the
    /// catalogue with it; no page is written. Checks nothing.
    Outcome CreateFromOptions();

    // Of the current help project.
    /// Lets the user choose a project of the source project and opens it in the editor.
    void OpenProject();
    void OpenHelpOfActiveProject();
    void OpenWebHelpOfActiveProject();
    /// Project file, index file and folder, with the desktop's programs for them.
    void OpenHelpProject();
    void OpenHelpProjectIndex();
    void OpenHelpFolder();
    /// As `CTovimarCompiler::RecompileHelpProject`.
    ResultCode RecompileHelpProject(bool vfSkipOpeningOfRecompiledHelp = false);
    /// As `CTovimarCompiler::RegenerateHelpProject`.
    ResultCode RegenerateHelpProject();

    // The system's own help, and who made it.
    void OpenHelpTopics();
    void OpenHelpIndex();
    void OpenHelpSearch();
    void OpenAboutForm();
    /// Shows it over the window; set by a program with windows.
    std::function<void(std::int32_t ownerWindow)> ShowAboutForm;

    /// What the user chose for retaken pictures; taken from the settings at the first read.
    clsScreenshotOptions& ScreenshotOptions();
    void GetScreenshotOptions();
    /// Retakes the picture of the active object; asks for the options first where they say so. True when a
    /// picture was taken.
    bool TakeScreenshotAction();
    /// Of an open form or report, into the places of the options. A topic is backed up first. False after a
    /// warning.
    bool TakeScreenshot(std::int32_t type, const std::string& name);

    /// The names joined by "|".
    static std::string concatProjectsListFromCollection(const KeyedList<std::string>& rcol);
    /// What a run made, in lines, for a kind of source project.
    static std::string SummaryText(const CTovimarStats& stats, const std::string& sourceProjectTypeName);

private:
    struct SourceProjects {
        std::string current;
        KeyedList<std::string> listed;
        KeyedList<std::string> usable; ///< those with a file
    };

    void OpenWizardForm(bool vfLoadSettings);
    bool ListSourceProjects(SourceProjects& projects);
    bool FindUsableProjects(SourceProjects& projects);
    /// Null after a warning.
    std::unique_ptr<CAddInProject> NewProject(const SourceProjects& projects, const std::string& name);
    void MakeTemporaryProject(const SourceProjects& projects, std::unique_ptr<CAddInProject> project);
    void TakeOverEarlierProject(CAddInProject& project);
    ResultCode CheckAndSaveOptions();
    void DropWizard();
    void TakeRunOptions();
    void LoadTree();
    void CompleteTree();
    Outcome RunGeneration();
    void EndRun(bool begun);

    std::unique_ptr<clsScreenshotOptions> screenshotOptions_;
    std::unique_ptr<IHelpWizardForm> wizard_;
    /// The last wizard that was closed: it is mostly the caller, so it stays until the next one opens.
    std::unique_ptr<IHelpWizardForm> closedWizard_;
    /// Project file that is made anew, in the folder of the help project.
    std::string earlierProjectFile_;
    bool terminated_ = false;
};

} // namespace tovimar
