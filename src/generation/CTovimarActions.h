#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <memory>
#include <string>

namespace tovimar {

class CAddInProject;
class CTovimarStats;
class clsScreenshotOptions;

/// What a caller of a generation decides beside the options. Empty fields take the source project's.
struct GenerationRequest {
    std::string folder; ///< Windows path of the help project's folder
    std::string projectName;
    std::string title;
    std::string application;
};

/// The user-level actions: check, ask, show, and call the machinery. This is the road of a generation without
/// a wizard: the options stand in the parameters, nobody is asked for them.
class CTovimarActions {
public:
    CTovimarActions();
    ~CTovimarActions();

    /// Why a generation can't start; 0 means it can.
    static constexpr ResultCode kOtherFolder = MakeResultCode(0x80040065U);
    static constexpr ResultCode kNameTaken = MakeResultCode(0x80040066U);
    static constexpr ResultCode kNoFolder = MakeResultCode(0x80040067U);
    static constexpr ResultCode kHelpFileLocked = MakeResultCode(0x80040068U);
    static constexpr ResultCode kNoWriteAccess = MakeResultCode(0x80040069U);

    /// Makes a help project of the source project at hand the current one and points the parameters at it. An
    /// earlier project of the same source and name in the folder is made anew under its own identifiers.
    /// False after a warning.
    bool PrepareProject(const GenerationRequest& request);
    /// Tests folder, name and help file; tells what is wrong. Makes the folder.
    ResultCode CheckIfGenerationPossible();

    enum class Outcome { Completed, Refused, Cancelled };
    /// Checks, loads the tree, generates, saves the catalogue and shows the result. Reported failures stand
    /// in the run's error count, also behind a completed run.
    Outcome GenerateFromOptions();

    /// What the user chose for retaken pictures; taken from the settings at the first read.
    clsScreenshotOptions& ScreenshotOptions();
    void GetScreenshotOptions();
    /// Retakes the picture of the active object; asks for the options first where they say so. True when a
    /// picture was taken.
    bool TakeScreenshotAction();
    /// Of an open form or report, into the places of the options. A topic is backed up first. False after a
    /// warning.
    bool TakeScreenshot(std::int32_t type, const std::string& name);

    /// What a run made, in lines, for a kind of source project.
    static std::string SummaryText(const CTovimarStats& stats, const std::string& sourceProjectTypeName);

private:
    bool FindSourceProjects(std::string& name, std::string& usable, int& count);
    void TakeOverEarlierProject(CAddInProject& project);
    void LoadTree();
    Outcome RunGeneration();

    std::unique_ptr<clsScreenshotOptions> screenshotOptions_;
    /// Project file that is made anew, in the folder of the help project.
    std::string earlierProjectFile_;
};

} // namespace tovimar
