#include "host/server/CTovimarServerAgent.h"

#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/sources/CHelpPrjSourceProject.h"
#include "platform/Value.h"
#include "platform/text/Text.h"

namespace tovimar {

void CTovimarServerAgent::Send(const std::string& name, CommandParameters parameters) {
    server_.SendCommand(CXmlCommand().Build(name, parameters).Serialize());
}

std::string CTovimarServerAgent::Ask(const std::string& name, CommandParameters parameters) {
    const std::string answer = server_.SendCommand(CXmlCommand().Build(name, parameters).Serialize());
    const CXmlCommand command = CXmlCommand().Deserialize(answer);
    // A host that failed leaves the answer without a result.
    return command.ParamDefined("RetValue") ? command.GetParamValue("RetValue") : std::string();
}

bool CTovimarServerAgent::AskBoolean(const std::string& name, CommandParameters parameters) {
    const std::string answer = text::TrimWhitespace(Ask(name, parameters));
    return !answer.empty() && Value(answer).AsBoolean();
}

std::int32_t CTovimarServerAgent::AskNumber(const std::string& name, CommandParameters parameters) {
    const std::string answer = text::TrimWhitespace(Ask(name, parameters));
    return answer.empty() ? 0 : Value(answer).AsInteger();
}

KeyedList<std::string> CTovimarServerAgent::AskList(const std::string& name) {
    KeyedList<std::string> names;
    const std::string answer = Ask(name);
    if (answer.empty())
        return names;
    for (const std::string& entry : text::Split(answer, "|"))
        if (!entry.empty())
            names.Add(CXmlCommand::ReplaceSpecialCharsRev(entry));
    return names;
}

KeyedList<std::string> CTovimarServerAgent::GetSourceProjectsList() {
    return AskList("GetSourceProjectsList");
}
KeyedList<std::string> CTovimarServerAgent::GetSourceFormsList() {
    return AskList("GetSourceFormsList");
}
KeyedList<std::string> CTovimarServerAgent::GetSourceWorksheetsList() {
    return AskList("GetSourceWorksheetsList");
}
KeyedList<std::string> CTovimarServerAgent::GetSourceChartsList() {
    return AskList("GetSourceChartsList");
}
KeyedList<std::string> CTovimarServerAgent::GetSourceReportsList() {
    return AskList("GetSourceReportsList");
}
KeyedList<std::string> CTovimarServerAgent::GetSourceTablesList() {
    return AskList("GetSourceTablesList");
}
KeyedList<std::string> CTovimarServerAgent::GetSourceQueriesList() {
    return AskList("GetSourceQueriesList");
}
KeyedList<std::string> CTovimarServerAgent::GetSourceMacrosList() {
    return AskList("GetSourceMacrosList");
}
std::string CTovimarServerAgent::GetComponentDescription(const std::string& compName) {
    return Ask("GetComponentDescription", {{"CompName", compName}});
}
std::string CTovimarServerAgent::GetQueryDescription(const std::string& compName) {
    return Ask("GetQueryDescription", {{"CompName", compName}});
}
std::string CTovimarServerAgent::GetMacroDescription(const std::string& compName) {
    return Ask("GetMacroDescription", {{"CompName", compName}});
}
std::string CTovimarServerAgent::GetWksHtml(const std::string& worksheetName) {
    return Ask("GetWksHtml", {{"XmlCmdParam_WksName", worksheetName}});
}
void CTovimarServerAgent::SetCurrentSourceProject(const std::string& projectName) {
    Send("SetCurrentSourceProject", {{"ProjectName", projectName}});
}
bool CTovimarServerAgent::AreThereAnySourceProjectsOpened() {
    return AskBoolean("AreThereAnySourceProjectsOpened");
}
bool CTovimarServerAgent::ComponentExistsTest(std::int32_t compType, const std::string& compName) {
    return AskBoolean("ComponentExistsTest", {{"CompType", compType}, {"CompName", compName}});
}
std::string CTovimarServerAgent::ActiveObjectName() {
    return Ask("ActiveObjectName");
}
std::string CTovimarServerAgent::CurrentObjectName() {
    return Ask("CurrentObjectName");
}
std::int32_t CTovimarServerAgent::CurrentObjectType() {
    return AskNumber("CurrentObjectType");
}
std::string CTovimarServerAgent::FormNamePrefix() {
    return Ask("FormNamePrefix");
}
std::string CTovimarServerAgent::ReportNamePrefix() {
    return Ask("ReportNamePrefix");
}
std::string CTovimarServerAgent::TableNamePrefix() {
    return Ask("TableNamePrefix");
}
std::string CTovimarServerAgent::QueryNamePrefix() {
    return Ask("QueryNamePrefix");
}
std::string CTovimarServerAgent::MacroNamePrefix() {
    return Ask("MacroNamePrefix");
}
bool CTovimarServerAgent::CurrentSourceProjectIsMDEorADE() {
    return AskBoolean("CurrentSourceProjectIsMDEorADE");
}
bool CTovimarServerAgent::CurrentSourceProjectIsADPorADE() {
    return AskBoolean("CurrentSourceProjectIsADPorADE");
}
bool CTovimarServerAgent::CurrentSourceProjectIsDirty() {
    return AskBoolean("CurrentSourceProjectIsDirty");
}
bool CTovimarServerAgent::CurrentSourceProjectIsNewUnsaved() {
    return AskBoolean("CurrentSourceProjectIsNewUnsaved");
}
bool CTovimarServerAgent::CurrentSourceProjectCodeIsDisabled() {
    return AskBoolean("CurrentSourceProjectCodeIsDisabled");
}
std::string CTovimarServerAgent::CurrentSourceProjectFullPath() {
    return Ask("CurrentSourceProjectFullPath");
}
std::string CTovimarServerAgent::CurrentSourceProjectName() {
    return Ask("CurrentSourceProjectName");
}
std::string CTovimarServerAgent::CurrentSourceProjectTypeName() {
    return Ask("CurrentSourceProjectTypeName");
}
std::string CTovimarServerAgent::CurrentSourceProjectLocation() {
    return Ask("CurrentSourceProjectLocation");
}
void CTovimarServerAgent::SetHelpFileForCurrentSourceProject(const std::string& helpFileFullPath) {
    Send("SetHelpFileForCurrentSourceProject", {{"HelpFileFullPath", helpFileFullPath}});
}

std::unique_ptr<IHelpPrjSourceProject> CTovimarServerAgent::ParseSourceProject() {
    const std::string path = CurrentSourceProjectFullPath();
    const std::string type = CurrentSourceProjectTypeName();
    const std::string found = "ProjectFullPath = " + path + ", ProjectTypeName = " + type;
    TraceText([&] { return "CTovimarServerAgent.ParseSourceProject: " + found; });
    if (path.empty())
        return nullptr;
    auto project = std::make_unique<CHelpPrjSourceProject>();
    project->Init(type, path);
    if (!project->IsValid())
        return nullptr;
    TraceText([&] { return "CTovimarServerAgent.ParseSourceProject: IsValid -> " + found; });
    return project;
}

std::int32_t CTovimarServerAgent::HostAppMainWindowHWnd() {
    return AskNumber("HostAppMainWindowHWnd");
}
void CTovimarServerAgent::HideIDEWindows() {
    Send("HideIDEWindows");
}
void CTovimarServerAgent::ResetIDEWindows() {
    Send("ResetIDEWindows");
}
void CTovimarServerAgent::SaveMakeRun(bool saveAppChanges, bool makeApp, bool runApp) {
    Send("SaveMakeRun", {{"SaveAppChanges", saveAppChanges}, {"MakeApp", makeApp}, {"RunApp", runApp}});
}

void CTovimarServerAgent::ProgressMeterInit(const std::string& message, std::int32_t maxVal) {
    TraceText([&] { return LongDateAndTime() + " -> " + message + " " + std::to_string(maxVal); });
    Send("ProgressMeterInit", {{"Message", message}, {"MaxVal", maxVal}});
}

void CTovimarServerAgent::ProgressMeterRemove() {
    TraceText([] { return LongDateAndTime() + " Remove progress meter"; });
    Send("ProgressMeterRemove");
}

void CTovimarServerAgent::ProgressMeterToggle(bool onFlag) {
    Send("ProgressMeterToggle", {{"OnFlag", onFlag}});
}
void CTovimarServerAgent::ProgressMeterUpdate(std::int32_t currentValue) {
    Send("ProgressMeterUpdate", {{"CurrentValue", currentValue}});
}
void CTovimarServerAgent::HourglassOn() {
    Send("HourglassOn");
}
void CTovimarServerAgent::HourglassOff() {
    Send("HourglassOff");
}
void CTovimarServerAgent::HourglassOffFinal() {
    Send("HourglassOffFinal");
}
void CTovimarServerAgent::Doevents() {
    Send("Doevents");
}
void CTovimarServerAgent::SaveAsText(std::int32_t objType, const std::string& objName,
                                     const std::string& fullPath) {
    Send("SaveAsText", {{"ObjType", objType}, {"ObjName", objName}, {"FullPath", fullPath}});
}
void CTovimarServerAgent::CloseComponent(std::int32_t objType, const std::string& objName,
                                         bool saveComponentFlag) {
    Send("CloseComponent",
         {{"ObjType", objType}, {"ObjName", objName}, {"SaveComponentFlag", saveComponentFlag}});
}
void CTovimarServerAgent::SetComponentHelpContextId(std::int32_t objType, const std::string& objName,
                                                    std::int32_t helpContextId) {
    Send("SetComponentHelpContextId",
         {{"ObjType", objType}, {"ObjName", objName}, {"HelpContextId", helpContextId}});
}
std::int32_t CTovimarServerAgent::ActivateComponent(std::int32_t objType, const std::string& objName,
                                                    bool forceOpenInDesignView, bool forceOpenAsHidden) {
    return AskNumber("ActivateComponent", {{"ObjType", objType},
                                           {"ObjName", objName},
                                           {"ForceOpenInDesignView", forceOpenInDesignView},
                                           {"ForceOpenAsHidden", forceOpenAsHidden}});
}
bool CTovimarServerAgent::ActivateControl(const std::string& controlFullPath, bool runtimeFlag,
                                          bool setFocusFlag) {
    return AskBoolean(
        "ActivateControl",
        {{"ControlFullPath", controlFullPath}, {"RuntimeFlag", runtimeFlag}, {"SetFocusFlag", setFocusFlag}});
}
void CTovimarServerAgent::CorrectInsideWidthAndHeigh(std::int32_t objType, const std::string& objName,
                                                     bool designViewFlag) {
    Send("CorrectInsideWidthAndHeigh",
         {{"ObjType", objType}, {"ObjName", objName}, {"DesignViewFlag", designViewFlag}});
}
void CTovimarServerAgent::ResetInsideWidthAndHeigh(std::int32_t objType, const std::string& objName,
                                                   bool designViewFlag) {
    Send("ResetInsideWidthAndHeigh",
         {{"ObjType", objType}, {"ObjName", objName}, {"DesignViewFlag", designViewFlag}});
}
void CTovimarServerAgent::ShowToolbar(const std::string& toolbarName) {
    Send("ShowToolbar", {{"ToolbarName", toolbarName}});
}

void CTovimarServerAgent::DeleteToolbar(const std::string& toolbarName) {
    Send("DeleteToolbar", {{"ToolbarName", toolbarName}});
}

bool CTovimarServerAgent::TakeScreenshot(std::int32_t objType, const std::string& objName,
                                         const std::string& picFullPath, const std::string& htmlFullPath) {
    return AskBoolean("TakeScreenshot", {{"ObjType", objType},
                                         {"ObjName", objName},
                                         {"PicFullPath", picFullPath},
                                         {"HTMLFullPath", htmlFullPath}});
}
bool CTovimarServerAgent::IDEDisplayModelIsMDI() {
    return AskBoolean("IDEDisplayModelIsMDI");
}
std::string CTovimarServerAgent::GetWinFormNameByHWND(std::int32_t hwnd) {
    return Ask("GetWinFormNameByHWND", {{"HWND", hwnd}});
}
std::string CTovimarServerAgent::GetQueryXmlStr(const std::string& queryName) {
    return Ask("GetQueryXmlStr", {{"QueryName", queryName}});
}
std::string CTovimarServerAgent::ScreenshotDatamodelWindow() {
    return Ask("ScreenshotDatamodelWindow");
}
void CTovimarServerAgent::UnhideDbWindow() {
    Send("UnhideDbWindow");
}
void CTovimarServerAgent::SetUseProjectGroupAsSourceFlag(bool useProjectGroupAsSourceFlag) {
    Send("SetUseProjectGroupAsSourceFlag", {{"UseProjectGroupAsSourceFlag", useProjectGroupAsSourceFlag}});
}

} // namespace tovimar
