#pragma once

#include "foundation/Session.h"
#include "platform/AutomationObject.h"
#include "platform/Error.h"

#include <cstdint>
#include <memory>
#include <string>

namespace tovimar {

class CTovimarStats;
class clsHtmlHelp;

/// What the parts of a run share: generator, settings, catalogue, messages, trace log, run state and the
/// system's own progress window. The session's accessors answer from here while a server is connected.
class CTovimarServerData : public IRunContext {
public:
    CTovimarServerData();
    ~CTovimarServerData() override;
    CTovimarServerData(const CTovimarServerData&) = delete;
    CTovimarServerData& operator=(const CTovimarServerData&) = delete;

    /// Lets go of everything in the order generator, catalogue, settings, application. A second call does
    /// nothing.
    void Release();

    CTovimarStats& GenerationStats();
    /// Made at the first call.
    CTovimar& Generator();
    /// Null before `LoadSettings`.
    CAddInProjects* Projects() const { return projects_.get(); }
    CAddInSettingsXmlFile* Settings() const { return settings_.get(); }
    CXmlMessages* Messages() const { return messages_.get(); }
    CTraceLog& TraceLog();
    /// Made at the first call.
    clsHtmlHelp& HtmlHelp();

    bool GenerationInterrupted() const;
    void SetGenerationInterrupted(bool vfInterrupted);
    bool GenerationInProgress() const;
    void SetGenerationInProgress(bool vfInProgress);

    /// The host's main window, asked for once.
    std::int32_t HostAppMainWindowHWnd();
    /// Name of a new help project: that of the source project's file, else of the current project.
    std::string NewTovimarProjectName();
    std::string NewTovimarProjectTitle();

    /// Messages, settings and catalogue, once per connection. Programs call it right after connecting.
    void LoadSettings(bool vfSkipIfLoaded = false);
    ResultCode ReLoadSettings(const std::string& vstrSettingsFileFullPath, bool vfLoadSettingsFromTvpFile);
    /// Warns when there is no open source project.
    bool IsMSAccessDbOpened();

    void ProgressBarInit(const std::string& vstrMessage, std::int32_t vlngMaximum);
    /// Nothing without an open progress window.
    void ProgressBarUpdate(const std::string& vstrMessage, std::int32_t vlngValue);
    void ProgressBarDispose();

    /// The add-in is used at run time of the documented application.
    bool Runtime = false;
    /// The host's application, set at connection.
    HostObject IDEAppInstance;

    std::string ReplaceTags(const std::string& text) override;
    bool AutomatedTestModeOn() override;
    bool WizardUnattendedExecution() override;
    bool VerboseTracing() override;
    std::string Language() override;
    std::string LanguageCode() override;
    std::string HelpProjectTitle() override;
    std::string CurrentSourceProjectFullPath() override;
    std::string SourceProjectsList() override;
    ResultCode SaveTree(const std::string& path, const std::string& extraAttributes,
                        const std::string& picsSubfolderName) override;

private:
    void TraceProgress(const char* operation, std::int32_t value);

    std::unique_ptr<CTovimarStats> stats_;
    std::unique_ptr<CTovimar> generator_;
    std::unique_ptr<CAddInProjects> projects_;
    std::unique_ptr<CAddInSettingsXmlFile> settings_;
    std::unique_ptr<CTraceLog> traceLog_;
    std::unique_ptr<CXmlMessages> messages_;
    std::unique_ptr<clsHtmlHelp> htmlHelp_;
    std::int32_t hostAppMainWindowHWnd_ = 0;
    std::string lastProgressText_;
    std::int32_t progressValue_ = 0;
    bool progressOpen_ = false;
    bool settingsLoaded_ = false;
};

} // namespace tovimar
