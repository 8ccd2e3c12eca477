#pragma once

#include "host/contract/CControlsCollection.h"
#include "platform/AutomationObject.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// The questions on which the description of one form or report is captured, and their answers. Positions
/// and sizes are in the unit that `ScaleMode` names; the Access processor gives pixels everywhere, also
/// where a name ends in "InTwips". A failing question is reported and answered with empty, 0 or null.
class IClientFormProcessor {
public:
    virtual ~IClientFormProcessor() = default;

    /// The open object of a catalogue entry, opened if need be; null if that failed.
    virtual HostObject FindActualFormOfComponent(const HostObject& robjComp, bool vfHidden = false,
                                                 bool vfForceOpenInDesignView = false) = 0;
    virtual HostObject FindActualReportOfComponent(const HostObject& robjComp, bool vfHidden = false,
                                                   bool vfForceOpenInDesignView = false) = 0;
    virtual void ActualFormClose(const HostObject& robjComp, const HostObject& rfrm, bool vfSave = false) = 0;
    virtual void ActualReportClose(const HostObject& robjComp, const HostObject& rrpt,
                                   bool vfSave = false) = 0;
    virtual void myDoevents() = 0;

    /// Never fails.
    virtual bool HasProperty(const HostObject& robjComp, const std::string& vstrPropertyName) = 0;
    virtual Value PropertyValue(const HostObject& robjComp, const std::string& vstrPropertyName) = 0;

    /// Caption, attached label or name.
    virtual std::string ComponentCaptionGet(const HostObject& robjComp) = 0;
    /// "Form", "Report", or the object's class name.
    virtual std::string ComponentTypeName(const HostObject& robjComp) = 0;
    virtual std::string ControlNameGet(const HostObject& TheControl) = 0;
    /// Caption, attached label or cleaned name.
    virtual std::string ControlCaptionGet(const HostObject& TheControl) = 0;
    /// Class name; "SubReport" for a subform frame that lies in a report.
    virtual std::string ObjectTypeName(const HostObject& rctl) = 0;

    virtual void SetFirstPageVisibleForTabControls(const HostObject& rfrmActual) = 0;
    /// Unit of the form's coordinates by the host's number; 3 is pixels.
    virtual std::int32_t ScaleMode(const HostObject& rfrmActual) = 0;
    /// The children of a form, report or container that count for the help.
    virtual CControlsCollection ControlsCollectionGet(const HostObject& rctl) = 0;
    virtual bool FormHasMenus(const HostObject& frmActual) = 0;
    /// Text with which a new section of the control begins.
    virtual std::string ControlSeedTextGet(const HostObject& rfrmActual, const HostObject& rctl) = 0;
    virtual std::string ComponentWindowCaptionGet(const HostObject& robjComp) = 0;

    /// Shows the page and gives it; null for a hidden page outside design view. Indexes from 0.
    virtual HostObject TabPageActivate(const HostObject& rfrmActual, const HostObject& rctlTabComp,
                                       std::int32_t vlngTabPageIdx) = 0;
    virtual std::string TabPageCaptionGet(const HostObject& rctlTabComp, std::int32_t vlngTabIdx,
                                          bool vfSetTabAsActive = false) = 0;
    virtual std::string TabControlCaptionGet(const HostObject& rctlTab) = 0;
    virtual std::int32_t TabControlPagesQtyGet(const HostObject& rctlTab) = 0;
    virtual CControlsCollection TabPageControlsCollectionGet(const HostObject& rctlTab,
                                                             std::int32_t vlngTabIdx) = 0;

    /// True for `ObjectType` form, report and the further form.
    virtual bool IsCorrectTypeForAForm(std::int32_t TypeComponent) = 0;
    virtual std::int32_t DisplayModel() = 0;
    virtual void CorrectInsideWidthAndHeight(std::int32_t vlngObjectType, const HostObject& rfrm,
                                             bool vfCompIsInDesignView) = 0;
    virtual void ResetInsideWidthAndHeight(std::int32_t vlngObjectType, const HostObject& rfrm,
                                           bool vfCompIsInDesignView) = 0;
    /// Lets go of what the processor holds; a second call does nothing.
    virtual void Terminate() = 0;

    virtual std::string FormNamePrefix() = 0;
    virtual std::string ReportNamePrefix() = 0;
    virtual std::string TableNamePrefix() = 0;
    virtual std::string QueryNamePrefix() = 0;
    virtual std::string MacroNamePrefix() = 0;

    virtual std::int32_t BorderStyle(const HostObject& rfrmActual) = 0;
    /// Given once, right after creation.
    virtual void SetIdeAppInstance(HostObject robjApp) = 0;

    /// Offset of the section that holds a control, and the height of its bar in design view.
    virtual std::int32_t ControlSectionOffsetY(const HostObject& rctl) = 0;
    virtual std::int32_t ControlSectionOffsetX(const HostObject& rctl) = 0;
    virtual std::int32_t ControlSectionTitleHeight(const HostObject& rctl) = 0;
    virtual std::string ControlSectionName(const HostObject& rctl) = 0;
    virtual bool IsMSAccess() = 0;

    /// Size of the object's picture.
    virtual void GetComponentWidthAndHeightInTwips(const HostObject& robjComp, const HostObject& rfrmActual,
                                                   std::int32_t& rvarWidth, std::int32_t& rvarHeight,
                                                   bool vfCaptureReportPreviewAreaOnly) = 0;
    /// Where the client area begins in the picture.
    virtual std::int32_t FormClientAreaOffsetX(const HostObject& rfrmActual) = 0;
    virtual std::int32_t FormClientAreaOffsetY(const HostObject& rfrmActual) = 0;
    /// The `Section` elements; empty when there are none.
    virtual std::string FormSectionsXML(const HostObject& rfrmActual) = 0;

    /// Place in the tab order; -1 where there is none.
    virtual void GetControlIndexes(const HostObject& rctl, std::int32_t& rlngTabIndex,
                                   std::int32_t& rlngIndex) = 0;
    /// Name of the control that a label is attached to, else empty.
    virtual std::string GetLabelControlParentName(const HostObject& rctl) = 0;
    virtual void GetControlRectangleInTwips(const HostObject& robjComp, const HostObject& rctl,
                                            std::int32_t& rlngLeft, std::int32_t& rlngTop,
                                            std::int32_t& rlngWidth, std::int32_t& rlngHeight) = 0;
    virtual void GetTabPageTabRectangleInTwips(std::int32_t vlngTabIdx, const HostObject& robjComp,
                                               const HostObject& rctl, std::int32_t& rlngLeft,
                                               std::int32_t& rlngTop, std::int32_t& rlngWidth,
                                               std::int32_t& rlngHeight) = 0;
    /// The window to capture.
    virtual std::int32_t GetComponentHwnd(std::int32_t vlngHostAppHWND, const HostObject& robjComp,
                                          const HostObject& rfrmActual) = 0;

    virtual void SetComponentHelpContextId(const HostObject& robjComp, const HostObject& rfrmActual,
                                           std::int32_t vlngHelpContextId) = 0;
    virtual std::int32_t GetComponentHelpContextId(const HostObject& robjComp,
                                                   const HostObject& rfrmActual) = 0;
    virtual std::int32_t GetControlHelpContextId(const HostObject& robjControl) = 0;
    virtual std::int32_t ActivateComponent(const HostObject& robjComp) = 0;
    /// The `Menus` part of a raw description.
    virtual std::string FormMenusXML(const HostObject& rfrmActual) = 0;

    virtual std::int32_t ToolbarButtonsQtyGet(const HostObject& rctlTab) = 0;
    virtual CControlsCollection ToolbarButtonsCollectionGet(const HostObject& rctlTab) = 0;
    virtual void GetToolbarButtonRectangleInTwips(std::int32_t vlngIdx, const HostObject& robjComp,
                                                  const HostObject& rctl, std::int32_t& rlngLeft,
                                                  std::int32_t& rlngTop, std::int32_t& rlngWidth,
                                                  std::int32_t& rlngHeight) = 0;
    /// Fields of a table ("Table") or query ("Query"), each with `Name`, `Caption`, `Description` and
    /// `TabIndex`.
    virtual CControlsCollection FieldsCollectionGet(const std::string& vstrObjName,
                                                    const std::string& vstrObjectTypeName) = 0;
};

} // namespace tovimar
