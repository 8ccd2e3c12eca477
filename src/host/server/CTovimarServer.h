#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

namespace tovimar {

class CRequestQueue;
class CTovimarActions;
class CTovimarServerAgent;
class CTovimarServerData;
class IHelpEditorForm;
class IHelpWizardForm;
class LoadedForm;

/// The one object through which menu, editor and core reach each other: the run's shared data, the sender of
/// commands, the user's actions and the editor's form. One per process. Wizard and editor never stand
/// together: each refuses to open while the other is loaded. Failures of the public operations are reported
/// under the class's name.
class CTovimarServer {
public:
    CTovimarServer();
    ~CTovimarServer();
    CTovimarServer(const CTovimarServer&) = delete;
    CTovimarServer& operator=(const CTovimarServer&) = delete;

    /// Registers this server with its data and its agent in the session.
    void Connect();
    /// Lets go of the run's data, the generator first, and leaves the session.
    void Disconnect();
    /// Ends wizard and editor.
    void CloseFormsOnDisconnection();

    /// Null while disconnected.
    CTovimarServerData* ServerData() const { return data_.get(); }
    CTovimarServerAgent* Agent() const { return agent_.get(); }
    /// Raises 91 while disconnected.
    CTovimarActions& Actions();

    /// Hands a command text to the host and gives the answer; a stopped run answers "0" itself.
    std::string SendCommand(const std::string& vstrCommand);
    /// Set by the connected client: command text in, answer out.
    std::function<std::string(const std::string&)> TovimarClientCallBack;

    // What the menu calls; see the operation of the same name in `CTovimarActions`.
    /// Refuses while the editor is open, on a host without a frame of its own, and for an unsaved workbook.
    void OpenNewProject();
    /// A while later, for a caller that is closed by it.
    void ReloadNewProject();
    /// Refuses while editor or wizard is open.
    void OpenProject();
    ResultCode ProcessWizardFormClosing(IHelpWizardForm& wizard);
    void OpenHelpOfActiveProject();
    void OpenWebHelpOfActiveProject();
    /// With the editor open, that gets the focus instead.
    void OpenHelpProject();
    void OpenHelpProjectIndex();
    void OpenHelpFolder();
    ResultCode RecompileHelpProject(bool vfSkipOpeningOfRecompiledHelp = false);
    /// Over the source project at hand.
    ResultCode RegenerateHelpProject();
    void OpenHelpTopics();
    void OpenHelpIndex();
    void OpenHelpSearch();
    void OpenAboutForm();
    bool TakeScreenshotAction();
    void GetScreenshotOptions();

    // Project and editor.
    /// Loads a project file with its settings and tree and shows it in the editor, if the program has one. An
    /// open editor is closed before; the file is backed up. 0, or why the project didn't become current.
    ResultCode ReloadTovimarProject(const std::string& vstrTvpFullPath);
    /// Keeps the last three states of a project file beside it: "z1_<file>.bak" is the newest. Unchanged
    /// since then, nothing is copied. An empty path needs no backup.
    bool BackUpHelpProjectFile(const std::string& vstrFullPath);
    /// Refuses while the wizard is open.
    void OpenHelpEditorForm();
    void SetFocusToHTMLEditor();
    void SetFocusOnHelpEditorForm();
    /// Lets the host see that the form is gone.
    void CloseEditor();
    /// Makes the editor's form; set by a program with windows.
    std::function<std::unique_ptr<IHelpEditorForm>()> MakeHelpEditorForm;
    /// By the name, without regard to case.
    bool IsFormLoaded(const std::string& name) const { return GetLoadedForm(name) != nullptr; }
    LoadedForm* GetLoadedForm(const std::string& name) const;

    /// Name of an object, or the predefined one, with "_" and a control's name behind it if there is one;
    /// fit for a file name. Without extension.
    std::string GetComponentFileName(const std::string& vstrObjName, const std::string& vstrCtlName = {},
                                     const std::string& vstrPredefinedFileName = {});
    std::string GetComponentFileNameWithPrefix(std::int32_t lngObjType, const std::string& vstrObjName,
                                               const std::string& vstrCtlName = {},
                                               const std::string& vstrPredefinedFileName = {});

    /// True once `TestThatHtmlWorkshopInstalled` has found the help compiler.
    bool HtmlWorkshopInstalled() const { return htmlWorkshopInstalled_; }
    /// 1 to go on, else the pressed button. Asks once per connection when the compiler is missing.
    std::int32_t TestThatHtmlWorkshopInstalled();

    void RuntimeErrorMessage(ResultCode ErrNum, std::int32_t ErrLine, const std::string& ErrSource,
                             const std::string& ErrDescription);
    void WriteTraceLogMessage(const std::string& vstrMessage);

private:
    void LoadProject(const std::string& path, ResultCode& result);

    std::unique_ptr<CTovimarServerData> data_;
    std::unique_ptr<CTovimarServerAgent> agent_;
    std::unique_ptr<CTovimarActions> actions_;
    std::unique_ptr<CRequestQueue> queue_;
    std::unique_ptr<IHelpEditorForm> helpEditor_;
    bool compilerTestDone_ = false;
    bool htmlWorkshopInstalled_ = false;
};

/// The process's server, made when there is none.
CTovimarServer& TheServer();
/// Forgets the server that `TheServer` made.
void ForgetServer();

} // namespace tovimar
