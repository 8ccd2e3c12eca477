#pragma once

#include "host/server/CXmlCommand.h"
#include "platform/KeyedList.h"

#include <cstdint>
#include <memory>
#include <string>

namespace tovimar {

class CTovimarServer;
class IHelpPrjSourceProject;

/// The sender of commands: one operation per command that the core sends, named as the command. An answer
/// that is missing or blank counts as 0 and so as False; the same holds for every answer of a stopped run.
/// Lists are names without keys; object types are the codes of `ObjectType`.
class CTovimarServerAgent {
public:
    explicit CTovimarServerAgent(CTovimarServer& server) : server_(server) {}

    KeyedList<std::string> GetSourceProjectsList();
    KeyedList<std::string> GetSourceFormsList();
    KeyedList<std::string> GetSourceWorksheetsList();
    KeyedList<std::string> GetSourceChartsList();
    KeyedList<std::string> GetSourceReportsList();
    KeyedList<std::string> GetSourceTablesList();
    KeyedList<std::string> GetSourceQueriesList();
    KeyedList<std::string> GetSourceMacrosList();
    /// Description of a table.
    std::string GetComponentDescription(const std::string& compName);
    std::string GetQueryDescription(const std::string& compName);
    std::string GetMacroDescription(const std::string& compName);
    std::string GetWksHtml(const std::string& worksheetName);

    void SetCurrentSourceProject(const std::string& projectName);
    bool AreThereAnySourceProjectsOpened();
    bool ComponentExistsTest(std::int32_t compType, const std::string& compName);
    std::string ActiveObjectName();
    std::string CurrentObjectName();
    std::int32_t CurrentObjectType();
    std::string FormNamePrefix();
    std::string ReportNamePrefix();
    std::string TableNamePrefix();
    std::string QueryNamePrefix();
    std::string MacroNamePrefix();
    bool CurrentSourceProjectIsMDEorADE();
    bool CurrentSourceProjectIsADPorADE();
    bool CurrentSourceProjectIsDirty();
    bool CurrentSourceProjectIsNewUnsaved();
    bool CurrentSourceProjectCodeIsDisabled();
    std::string CurrentSourceProjectFullPath();
    std::string CurrentSourceProjectName();
    std::string CurrentSourceProjectTypeName();
    /// With a trailing backslash.
    std::string CurrentSourceProjectLocation();
    void SetHelpFileForCurrentSourceProject(const std::string& helpFileFullPath);
    /// Reads the source project at hand; null when none is open or none could be read.
    std::unique_ptr<IHelpPrjSourceProject> ParseSourceProject();

    std::int32_t HostAppMainWindowHWnd();
    void HideIDEWindows();
    void ResetIDEWindows();
    void SaveMakeRun(bool saveAppChanges, bool makeApp, bool runApp);
    void ProgressMeterInit(const std::string& message, std::int32_t maxVal);
    void ProgressMeterRemove();
    void ProgressMeterToggle(bool onFlag);
    void ProgressMeterUpdate(std::int32_t currentValue);
    void HourglassOn();
    void HourglassOff();
    void HourglassOffFinal();
    void Doevents();
    void SaveAsText(std::int32_t objType, const std::string& objName, const std::string& fullPath);
    void CloseComponent(std::int32_t objType, const std::string& objName, bool saveComponentFlag);
    void SetComponentHelpContextId(std::int32_t objType, const std::string& objName,
                                   std::int32_t helpContextId);
    /// The object's window.
    std::int32_t ActivateComponent(std::int32_t objType, const std::string& objName,
                                   bool forceOpenInDesignView, bool forceOpenAsHidden);
    bool ActivateControl(const std::string& controlFullPath, bool runtimeFlag, bool setFocusFlag);
    void CorrectInsideWidthAndHeigh(std::int32_t objType, const std::string& objName, bool designViewFlag);
    void ResetInsideWidthAndHeigh(std::int32_t objType, const std::string& objName, bool designViewFlag);
    /// The toolbar of the screenshot tool in the host.
    void ShowToolbar(const std::string& toolbarName);
    void DeleteToolbar(const std::string& toolbarName);
    bool TakeScreenshot(std::int32_t objType, const std::string& objName, const std::string& picFullPath,
                        const std::string& htmlFullPath);
    bool IDEDisplayModelIsMDI();
    std::string GetWinFormNameByHWND(std::int32_t hwnd);
    std::string GetQueryXmlStr(const std::string& queryName);
    /// Takes the picture of the relations and gives their list as HTML; empty without relations.
    std::string ScreenshotDatamodelWindow();
    void UnhideDbWindow();
    void SetUseProjectGroupAsSourceFlag(bool useProjectGroupAsSourceFlag);

    /// Sends without looking at the answer.
    void Send(const std::string& name, CommandParameters parameters = {});
    /// The answer's `RetValue`.
    std::string Ask(const std::string& name, CommandParameters parameters = {});

private:
    bool AskBoolean(const std::string& name, CommandParameters parameters = {});
    std::int32_t AskNumber(const std::string& name, CommandParameters parameters = {});
    KeyedList<std::string> AskList(const std::string& name);

    CTovimarServer& server_;
};

} // namespace tovimar
