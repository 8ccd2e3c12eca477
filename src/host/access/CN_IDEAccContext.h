#pragma once

#include "host/contract/IHostIDEContext.h"
#include "host/contract/IHostIDEContextCommands.h"

#include <memory>
#include <string>

namespace tovimar {

class CN_IDEAccFormProcessor;
class CXmlCommand;

/// The host side for Access: every command text becomes calls of the application's automation members.
class CN_IDEAccContext : public IHostIDEContext, public IHostIDEContextCommands {
public:
    CN_IDEAccContext();
    ~CN_IDEAccContext() override;

    ResultCode Connect(HostObject robjHostIDE) override;
    ResultCode Disconnect() override;
    std::string ProcessCallBack(const std::string& vstrXmlCommand) override;

    HostObject GetCurrentProjectItemByName(const std::string& vstrItemName) override;
    HostObject CurrentProject() override;
    HostObject IDE() override { return application_; }
    bool IDEDisplayModelIsMDI() override { return true; }
    bool UseProjectGroupAsSource() override { return useProjectGroupAsSource_; }
    void SetUseProjectGroupAsSource(bool vfUse) override { useProjectGroupAsSource_ = vfUse; }
    std::string SourceProjectsList() override;
    void SetCurrentSourceProject(const std::string& vstrProjectName) override;
    bool AreThereAnySourceProjectsOpened() override;
    std::string CurrentSourceProjectFullPath() override;
    std::string CurrentSourceProjectName() override;
    std::string CurrentSourceProjectTypeName() override;
    bool CurrentSourceProjectIsDirty() override;
    std::string CurrentSourceProjectLocation() override;
    bool CurrentSourceProjectIsMDEorADE() override;
    bool CurrentSourceProjectIsADPorADE() override;
    std::int32_t HostAppMainWindowHWnd() override;
    /// Access has no such windows.
    void HideIDEWindows() override {}
    void ResetIDEWindows() override {}
    std::string CurrentObjectName() override;
    std::int32_t CurrentObjectType() override;
    bool CurrentSourceProjectIsNewUnsaved() override { return false; }
    bool CurrentSourceProjectCodeIsDisabled() override { return false; }

    /// Without effect: the help file is written into each object.
    void SetHelpFileForCurrentSourceProject(const std::string&) override {}
    void SaveMakeRun(bool, bool, bool) override {}
    void ProgressMeterInit(const std::string& vstrMsg, std::int32_t vlngMaxVal) override;
    void ProgressMeterRemove() override;
    /// Each call flips a running meter, whatever the flag says.
    void ProgressMeterToggle(bool vfOn) override;
    void ProgressMeterUpdate(std::int32_t vlngCurVal) override;
    void HourglassOn() override;
    void HourglassOff() override;
    void HourglassOffFinal() override;
    void myDoevents() override;
    bool ComponentExists(std::int32_t vlngCompType, const std::string& vstrCompName) override;
    std::string FormNamePrefix() override;
    std::string ReportNamePrefix() override;
    std::string TableNamePrefix() override;
    std::string QueryNamePrefix() override;
    std::string MacroNamePrefix() override;
    void CloseComponent(std::int32_t vlngCompType, const std::string& vstrCompName, bool vfSave) override;
    void SetComponentHelp(std::int32_t vlngCompType, const std::string& vstrCompName,
                          std::int32_t vlngHelpContextId) override;
    std::int32_t ActivateComponent(std::int32_t vlngCompType, const std::string& vstrCompName,
                                   bool vfForceOpenInDesignView = false,
                                   bool vfForceOpenAsHidden = false) override;
    bool ActivateControl(const std::string& vstrControlFullPath, bool vfRuntime, bool vfSetFocus) override;
    void CorrectInsideWidthAndHeight(std::int32_t vlngObjType, const std::string& vstrObjName,
                                     bool vfCompIsInDesignView) override;
    void ResetInsideWidthAndHeight(std::int32_t vlngObjType, const std::string& vstrObjName,
                                   bool vfCompIsInDesignView) override;

    /// Name of the active form, else of the active report, else empty.
    std::string ActiveObjectName();
    /// A failure leaves no file and is only traced.
    void SaveAsText(std::int32_t type, const std::string& name, const std::string& path);
    /// The fields of a query by where they come from, as XML for the query's topic.
    std::string GetQueryXmlDescription(const HostObject& rapp, const std::string& vstrQueryName);
    /// The raw description of an object, by the parameters of the command "ProcessComponent". Raises
    /// 0x80040001 for an unknown type and 0x80040002 when nothing could be described.
    std::string ProcessComponent(const CXmlCommand& command);
    /// Saves the picture of the relations window and gives the list of relations as HTML.
    std::string ScreenshotDatamodelWindow();
    /// Takes the picture of an object and, with a path for it, writes its topic.
    void TakeScreenshot(std::int32_t type, const std::string& name, const std::string& picPath,
                        const std::string& htmlPath);
    /// One host version hides its main window behind the add-in.
    void UnhideDbWindow();

private:
    HostObject CatalogueEntry(std::int32_t type, const std::string& name);
    HostObject OpenObjectByName(std::int32_t type, const std::string& name);
    HostObject FindActual(std::int32_t type, const std::string& name, bool hidden, bool designView);
    void SysCmd(std::int32_t action, const AutomationObject::Arguments& arguments = {});

    HostObject application_;
    HostObject currentProject_;
    std::unique_ptr<CN_IDEAccFormProcessor> formProcessor_;
    struct Meter {
        std::string message;
        bool defined = false;
        bool shown = false;
        std::int32_t maximum = 0;
        std::int32_t value = 0;
    } meter_;
    std::int32_t hourglassCount_ = 0;
    bool useProjectGroupAsSource_ = false;
};

} // namespace tovimar
