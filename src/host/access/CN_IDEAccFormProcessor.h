#pragma once

#include "host/access/clsAccCmdBarControls.h"
#include "host/contract/IClientFormProcessor.h"
#include "uimodel/clsAccFormDimensions.h"

#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

namespace tovimar {

/// The form layer for Access. Its rules decide which controls the help lists, what name and caption each
/// gets, and how tab pages, subforms and datasheets are measured. All positions are pixels.
class CN_IDEAccFormProcessor : public IClientFormProcessor {
public:
    CN_IDEAccFormProcessor();
    ~CN_IDEAccFormProcessor() override;

    HostObject FindActualFormOfComponent(const HostObject& robjComp, bool vfHidden = false,
                                         bool vfForceOpenInDesignView = false) override;
    HostObject FindActualReportOfComponent(const HostObject& robjComp, bool vfHidden = false,
                                           bool vfForceOpenInDesignView = false) override;
    void ActualFormClose(const HostObject& robjComp, const HostObject& rfrm, bool vfSave = false) override;
    void ActualReportClose(const HostObject& robjComp, const HostObject& rrpt, bool vfSave = false) override;
    void myDoevents() override;

    bool HasProperty(const HostObject& robjComp, const std::string& vstrPropertyName) override;
    Value PropertyValue(const HostObject& robjComp, const std::string& vstrPropertyName) override;
    std::string ComponentCaptionGet(const HostObject& robjComp) override;
    std::string ComponentTypeName(const HostObject& robjComp) override;
    std::string ControlNameGet(const HostObject& TheControl) override;
    std::string ControlCaptionGet(const HostObject& TheControl) override;
    std::string ObjectTypeName(const HostObject& rctl) override;

    void SetFirstPageVisibleForTabControls(const HostObject& rfrmActual) override;
    std::int32_t ScaleMode(const HostObject&) override { return 3; }
    CControlsCollection ControlsCollectionGet(const HostObject& rctl) override;
    bool FormHasMenus(const HostObject&) override { return false; }
    std::string ControlSeedTextGet(const HostObject& rfrmActual, const HostObject& rctl) override;
    /// The name without its first five characters, the prefix of the window's class.
    std::string ComponentWindowCaptionGet(const HostObject& robjComp) override;
    HostObject TabPageActivate(const HostObject& rfrmActual, const HostObject& rctlTabComp,
                               std::int32_t vlngTabPageIdx) override;
    std::string TabPageCaptionGet(const HostObject& rctlTabComp, std::int32_t vlngTabIdx,
                                  bool vfSetTabAsActive = false) override;
    std::string TabControlCaptionGet(const HostObject& rctlTab) override;
    std::int32_t TabControlPagesQtyGet(const HostObject& rctlTab) override;
    CControlsCollection TabPageControlsCollectionGet(const HostObject& rctlTab,
                                                     std::int32_t vlngTabIdx) override;

    bool IsCorrectTypeForAForm(std::int32_t TypeComponent) override;
    std::int32_t DisplayModel() override { return 1; }
    void CorrectInsideWidthAndHeight(std::int32_t vlngObjectType, const HostObject& rfrm,
                                     bool vfCompIsInDesignView) override;
    void ResetInsideWidthAndHeight(std::int32_t vlngObjectType, const HostObject& rfrm,
                                   bool vfCompIsInDesignView) override;
    void Terminate() override;

    std::string FormNamePrefix() override { return "frm"; }
    std::string ReportNamePrefix() override { return "rpt"; }
    std::string TableNamePrefix() override { return "tbl"; }
    std::string QueryNamePrefix() override { return "qry"; }
    std::string MacroNamePrefix() override { return "mcr"; }

    std::int32_t BorderStyle(const HostObject& rfrmActual) override;
    void SetIdeAppInstance(HostObject robjApp) override { application_ = std::move(robjApp); }
    std::int32_t ControlSectionOffsetY(const HostObject& rctl) override;
    std::int32_t ControlSectionOffsetX(const HostObject& rctl) override;
    std::int32_t ControlSectionTitleHeight(const HostObject& rctl) override;
    std::string ControlSectionName(const HostObject& rctl) override;
    bool IsMSAccess() override { return true; }
    void GetComponentWidthAndHeightInTwips(const HostObject& robjComp, const HostObject& rfrmActual,
                                           std::int32_t& rvarWidth, std::int32_t& rvarHeight,
                                           bool vfCaptureReportPreviewAreaOnly) override;
    std::int32_t FormClientAreaOffsetX(const HostObject& rfrmActual) override;
    std::int32_t FormClientAreaOffsetY(const HostObject& rfrmActual) override;
    std::string FormSectionsXML(const HostObject& rfrmActual) override;
    void GetControlIndexes(const HostObject& rctl, std::int32_t& rlngTabIndex,
                           std::int32_t& rlngIndex) override;
    std::string GetLabelControlParentName(const HostObject& rctl) override;
    void GetControlRectangleInTwips(const HostObject& robjComp, const HostObject& rctl,
                                    std::int32_t& rlngLeft, std::int32_t& rlngTop, std::int32_t& rlngWidth,
                                    std::int32_t& rlngHeight) override;
    void GetTabPageTabRectangleInTwips(std::int32_t vlngTabIdx, const HostObject& robjComp,
                                       const HostObject& rctl, std::int32_t& rlngLeft, std::int32_t& rlngTop,
                                       std::int32_t& rlngWidth, std::int32_t& rlngHeight) override;
    std::int32_t GetComponentHwnd(std::int32_t vlngHostAppHWND, const HostObject& robjComp,
                                  const HostObject& rfrmActual) override;
    void SetComponentHelpContextId(const HostObject& robjComp, const HostObject& rfrmActual,
                                   std::int32_t vlngHelpContextId) override;
    std::int32_t GetComponentHelpContextId(const HostObject& robjComp, const HostObject& rfrmActual) override;
    std::int32_t GetControlHelpContextId(const HostObject& robjControl) override;
    std::int32_t ActivateComponent(const HostObject&) override { return 0; }
    std::string FormMenusXML(const HostObject&) override { return {}; }
    std::int32_t ToolbarButtonsQtyGet(const HostObject&) override { return 0; }
    CControlsCollection ToolbarButtonsCollectionGet(const HostObject&) override { return {}; }
    void GetToolbarButtonRectangleInTwips(std::int32_t, const HostObject&, const HostObject&, std::int32_t&,
                                          std::int32_t&, std::int32_t&, std::int32_t&) override {}
    CControlsCollection FieldsCollectionGet(const std::string& vstrObjName,
                                            const std::string& vstrObjectTypeName) override;

    /// Sentences on what the click of a command button does, as HTML; empty when there is nothing to say.
    std::string GetOnClickActionDescription(const HostObject& rapp, const HostObject& rfrm,
                                            const HostObject& rctl);
    /// Kinds that no help lists: lines, pictures and the like; tab controls and pages right on a report.
    static bool IsSkippedControlType(const std::string& typeName, std::int32_t objectType);

private:
    struct Opening;
    /// What is worked out once per form; kept until a form is opened, closed or resized.
    struct FormFacts;

    HostObject FindActual(Opening& opening);
    HostObject OpenForm(const Opening& opening);
    HostObject OpenReport(const Opening& opening);
    bool RetryAfter(const Opening& opening, ResultCode error);
    void CloseObject(std::int32_t objectType, const std::string& name, bool save);
    bool CorrectionApplies(std::int32_t objectType, bool designView) const;
    void EnlargeWindow(const HostObject& form);
    std::string CleanedName(const std::string& name) const;
    std::string AttachedLabel(const HostObject& control);
    const FormFacts& FactsOf(const HostObject& form);
    void ForgetForms();
    HostObject ChildrenOf(const HostObject& object, const std::string& typeName);
    CControlsCollection FilteredChildren(const HostObject& object, const std::string& typeName);
    void PlaceInDatasheet(const HostObject& form, const HostObject& control, platform::Rectangle& rectangle);

    HostObject application_;
    std::unique_ptr<clsAccCmdBarControls> commandBars_;
    std::int32_t savedInsideWidth_ = 0;
    std::int32_t savedInsideHeight_ = 0;
    bool terminated_ = false;
    clsAccFormDimensions dimensions_;
    std::unordered_map<const void*, std::unique_ptr<FormFacts>> forms_;
};

} // namespace tovimar
