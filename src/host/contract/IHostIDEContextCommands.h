#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

/// What the core asks a host to do. Reached by commands; object types are the codes of `ObjectType`.
class IHostIDEContextCommands {
public:
    virtual ~IHostIDEContextCommands() = default;

    virtual void SetHelpFileForCurrentSourceProject(const std::string& vstrHelpFileFullPath) = 0;
    virtual void SaveMakeRun(bool vfSaveAppChanges, bool vfMakeApp, bool vfRunApp) = 0;

    /// A meter in the host's status area, from 0 to the maximum.
    virtual void ProgressMeterInit(const std::string& vstrMsg, std::int32_t vlngMaxVal) = 0;
    virtual void ProgressMeterRemove() = 0;
    /// Takes a running meter away or brings it back with message and position.
    virtual void ProgressMeterToggle(bool vfOn) = 0;
    /// Ignored while no meter shows.
    virtual void ProgressMeterUpdate(std::int32_t vlngCurVal) = 0;

    /// Calls nest.
    virtual void HourglassOn() = 0;
    virtual void HourglassOff() = 0;
    /// Gives the pointer back whatever the count.
    virtual void HourglassOffFinal() = 0;
    virtual void myDoevents() = 0;

    /// True for a form or report of that name; other types aren't looked up and give True.
    virtual bool ComponentExists(std::int32_t vlngCompType, const std::string& vstrCompName) = 0;
    virtual std::string FormNamePrefix() = 0;
    virtual std::string ReportNamePrefix() = 0;
    virtual std::string TableNamePrefix() = 0;
    virtual std::string QueryNamePrefix() = 0;
    virtual std::string MacroNamePrefix() = 0;

    virtual void CloseComponent(std::int32_t vlngCompType, const std::string& vstrCompName, bool vfSave) = 0;
    /// Writes identifier and help file name into the object.
    virtual void SetComponentHelp(std::int32_t vlngCompType, const std::string& vstrCompName,
                                  std::int32_t vlngHelpContextId) = 0;
    /// Opens the object; its window, 0 if it has none.
    virtual std::int32_t ActivateComponent(std::int32_t vlngCompType, const std::string& vstrCompName,
                                           bool vfForceOpenInDesignView = false,
                                           bool vfForceOpenAsHidden = false) = 0;
    /// Path such as "Form.Orders.Page.pgItems.Subform.subItems.TextBox.txtQty", through subforms and pages.
    virtual bool ActivateControl(const std::string& vstrControlFullPath, bool vfRuntime, bool vfSetFocus) = 0;

    /// Prepares an open object for a picture; each call is followed by one of the other.
    virtual void CorrectInsideWidthAndHeight(std::int32_t vlngObjType, const std::string& vstrObjName,
                                             bool vfCompIsInDesignView) = 0;
    virtual void ResetInsideWidthAndHeight(std::int32_t vlngObjType, const std::string& vstrObjName,
                                           bool vfCompIsInDesignView) = 0;
};

} // namespace tovimar
