// Opening, measuring and closing forms and reports.
#include "host/access/CN_IDEAccFormProcessor.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "host/access/AccessProject.h"
#include "host/access/FormFacts.h"
#include "host/access/LateBound.h"
#include "host/contract/ObjectTypes.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "platform/windowing/WindowSystem.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CN_IDEAccFormProcessor";
constexpr ResultCode kActionCancelled = 2501;
constexpr ResultCode kCancelledByObject = 3071;
constexpr ResultCode kNoPreview = 2213;
constexpr std::uint32_t kRetryCancelQuestion = kMsgRetryCancel | kMsgQuestion;
/// Boxes that answer themselves press Retry: the question must come to an end without a person.
constexpr int kMostTries = 10;

/// The host's numbers of views and of the window mode "hidden".
constexpr std::int32_t kNormalView = 0;
constexpr std::int32_t kDesignView = 1;
constexpr std::int32_t kPreview = 2;
constexpr std::int32_t kDatasheetView = 3;
constexpr std::int32_t kHiddenWindow = 1;
constexpr std::int32_t kDefaultViewDatasheet = 2;
constexpr std::int32_t kSaveYes = 1;
constexpr std::int32_t kSaveNo = 2;

constexpr int kSections = 16;

bool NormalViewAskedFor() {
    const CTovimarParameters* parameters = Session::Parameters();
    return parameters != nullptr && parameters->MakeNormalViewScreenshots;
}

HostObject DoCmd(const HostObject& app) {
    return late::Object(app, "DoCmd");
}

/// First window of the class below `parent`, 0 for none.
std::int32_t ChildWindow(std::int32_t parent, const char* className) {
    auto& windows = *platform::Env().windows;
    for (auto child = windows.FirstChild(parent); child != 0; child = windows.NextSibling(child)) {
        const platform::Window* window = windows.Find(child);
        if (window != nullptr && text::EqualsIgnoringCase(window->className, className))
            return child;
    }
    return 0;
}

bool TakeWindowSize(std::int32_t handle, std::int32_t& width, std::int32_t& height) {
    const platform::Window* window = handle == 0 ? nullptr : platform::Env().windows->Find(handle);
    if (window == nullptr)
        return false;
    width = window->rectangle.Width();
    height = window->rectangle.Height();
    return true;
}

std::int32_t Pixels(double twips, int twipsPerPixel) {
    return platform::access::RoundToEven(twips / twipsPerPixel);
}

} // namespace

struct CN_IDEAccFormProcessor::Opening {
    std::int32_t objectType = ObjectType::kForm;
    std::string name;
    bool hidden = false;
    bool forceDesign = false;
    bool normalView = false; ///< decided from the parameters and the kind of project
    int tries = 0;

    bool IsForm() const { return objectType == ObjectType::kForm; }
    const char* Collection() const { return IsForm() ? "Forms" : "Reports"; }
};

HostObject CN_IDEAccFormProcessor::FindActualFormOfComponent(const HostObject& robjComp, bool vfHidden,
                                                             bool vfForceOpenInDesignView) {
    HostObject form;
    Trapped(kClass, "IClientFormProcessor_FindActualFormOfComponent", [&] {
        Opening opening{ObjectType::kForm, late::Text(robjComp, "Name"), vfHidden, vfForceOpenInDesignView};
        form = FindActual(opening);
        if (form && !vfHidden)
            late::Call(form, "SetFocus");
    });
    return form;
}

HostObject CN_IDEAccFormProcessor::FindActualReportOfComponent(const HostObject& robjComp, bool vfHidden,
                                                               bool vfForceOpenInDesignView) {
    HostObject report;
    Trapped(kClass, "IClientFormProcessor_FindActualReportOfComponent", [&] {
        Opening opening{ObjectType::kReport, late::Text(robjComp, "Name"), vfHidden, vfForceOpenInDesignView};
        report = FindActual(opening);
    });
    return report;
}

HostObject CN_IDEAccFormProcessor::FindActual(Opening& opening) {
    if (HostObject open = late::ObjectOrNull(application_, opening.Collection(), {opening.name}))
        return open;
    opening.normalView =
        (NormalViewAskedFor() && !opening.forceDesign) || access_project::IsMDEorADE(application_);
    ForgetForms();
    while (true) {
        try {
            return opening.IsForm() ? OpenForm(opening) : OpenReport(opening);
        } catch (const RaisedError& failure) {
            ++opening.tries;
            if (RetryAfter(opening, failure.Number()))
                continue;
            const bool told = failure.Number() == kActionCancelled ||
                              failure.Number() == kCancelledByObject || failure.Number() == kNoPreview;
            CloseObject(opening.objectType, opening.name, /*save=*/false);
            if (told)
                return nullptr;
            throw;
        }
    }
}

HostObject CN_IDEAccFormProcessor::OpenForm(const Opening& opening) {
    const HostObject doCmd = DoCmd(application_);
    if (opening.hidden) {
        late::Call(doCmd, "OpenForm", {opening.name, kDesignView, {}, {}, {}, kHiddenWindow});
    } else if (opening.normalView) {
        late::Call(doCmd, "OpenForm", {opening.name, kNormalView});
        myDoevents();
        const HostObject form = late::ObjectOrNull(application_, "Forms", {opening.name});
        if (form && late::Integer(form, "DefaultView") == kDefaultViewDatasheet) {
            late::Call(doCmd, "Close", {ObjectType::kForm, opening.name, kSaveNo});
            late::Call(doCmd, "OpenForm", {opening.name, kDatasheetView});
        }
    } else {
        late::Call(doCmd, "OpenForm", {opening.name, kDesignView});
    }
    return late::Object(application_, "Forms", {opening.name});
}

HostObject CN_IDEAccFormProcessor::OpenReport(const Opening& opening) {
    const bool preview = opening.normalView && !opening.hidden;
    late::Call(DoCmd(application_), "OpenReport", {opening.name, preview ? kPreview : kDesignView});
    myDoevents();
    return late::Object(application_, "Reports", {opening.name});
}

// True when the person wants the failing step to be repeated.
bool CN_IDEAccFormProcessor::RetryAfter(const Opening& opening, ResultCode error) {
    if (error == kNoPreview && !opening.IsForm() && opening.normalView && !opening.hidden) {
        ShowMessage("Making a screenshot of report " + opening.name +
                        " was not successful\r\n"
                        "You can make this screenshot later using the Tovimar\u2019s screenshot tool.",
                    kMsgExclamation, kApplicationTitle);
        return false;
    }
    const bool asked =
        error == kCancelledByObject || (error == kActionCancelled && (opening.IsForm() || !opening.hidden));
    if (!asked || opening.tries >= kMostTries || Session::Run().generationInterrupted)
        return false;
    const std::string question =
        opening.IsForm()
            ? "OpenForm action was cancelled for [" + opening.name + "] form, would you like to retry?"
            : "OpenReport action was cancelled for [" + opening.name + "] report, would you like to retry?";
    return ShowMessage(question, kRetryCancelQuestion, kApplicationTitle) == platform::kAnswerRetry;
}

// Failures are of no interest: an object that isn't open needs no closing.
void CN_IDEAccFormProcessor::CloseObject(std::int32_t objectType, const std::string& name, bool save) {
    ForgetForms();
    try {
        late::Call(DoCmd(application_), "Close", {objectType, name, save ? kSaveYes : kSaveNo});
    } catch (const RaisedError&) {
        return;
    }
}

void CN_IDEAccFormProcessor::ActualFormClose(const HostObject&, const HostObject& rfrm, bool vfSave) {
    if (!rfrm)
        return;
    Trapped(kClass, "IClientFormProcessor_ActualFormClose", [&] {
        ForgetForms();
        late::Call(DoCmd(application_), "Close",
                   {ObjectType::kForm, late::Text(rfrm, "Name"), vfSave ? kSaveYes : kSaveNo});
        myDoevents();
    });
}

void CN_IDEAccFormProcessor::ActualReportClose(const HostObject&, const HostObject& rrpt, bool vfSave) {
    if (!rrpt)
        return;
    Trapped(kClass, "IClientFormProcessor_ActualReportClose", [&] {
        ForgetForms();
        late::Call(DoCmd(application_), "Close",
                   {ObjectType::kReport, late::Text(rrpt, "Name"), vfSave ? kSaveYes : kSaveNo});
        myDoevents();
    });
}

bool CN_IDEAccFormProcessor::CorrectionApplies(std::int32_t objectType, bool designView) const {
    return objectType == ObjectType::kForm && designView && !NormalViewAskedFor() &&
           !access_project::IsMDEorADE(application_);
}

void CN_IDEAccFormProcessor::CorrectInsideWidthAndHeight(std::int32_t vlngObjectType, const HostObject& rfrm,
                                                         bool vfCompIsInDesignView) {
    Trapped(kClass, "IClientFormProcessor_CorrectInsideWidthAndHeight", [&] {
        commandBars_ = std::make_unique<clsAccCmdBarControls>();
        commandBars_->Init(application_);
        commandBars_->Up();
        myDoevents();
        if (!CorrectionApplies(vlngObjectType, vfCompIsInDesignView))
            return;
        EnlargeWindow(rfrm);
        myDoevents();
    });
}

// The window shows the whole design surface, each section with its title bar.
void CN_IDEAccFormProcessor::EnlargeWindow(const HostObject& form) {
    constexpr std::int32_t kSpareWidth = 40;
    constexpr std::int32_t kTitleBarHeight = 255;
    constexpr std::int32_t kSpareHeight = 60;
    savedInsideWidth_ = late::Integer(form, "InsideWidth");
    savedInsideHeight_ = late::Integer(form, "InsideHeight");
    std::int32_t height = kSpareHeight;
    for (std::int32_t i = 0; i < kSections; ++i)
        if (const HostObject section = late::ObjectOrNull(form, "Section", {i}))
            height += late::Integer(section, "Height") + kTitleBarHeight;
    ForgetForms();
    late::Set(form, "InsideWidth", late::Integer(form, "Width") + kSpareWidth);
    late::Set(form, "InsideHeight", height);
}

void CN_IDEAccFormProcessor::ResetInsideWidthAndHeight(std::int32_t vlngObjectType, const HostObject& rfrm,
                                                       bool vfCompIsInDesignView) {
    Trapped(kClass, "IClientFormProcessor_ResetInsideWidthAndHeight", [&] {
        if (commandBars_)
            commandBars_->RestoreState();
        commandBars_.reset();
        myDoevents();
        if (!CorrectionApplies(vlngObjectType, vfCompIsInDesignView))
            return;
        ForgetForms();
        late::Set(rfrm, "InsideWidth", savedInsideWidth_);
        late::Set(rfrm, "InsideHeight", savedInsideHeight_);
        myDoevents();
    });
}

void CN_IDEAccFormProcessor::GetComponentWidthAndHeightInTwips(const HostObject&,
                                                               const HostObject& rfrmActual,
                                                               std::int32_t& rvarWidth,
                                                               std::int32_t& rvarHeight,
                                                               bool vfCaptureReportPreviewAreaOnly) {
    rvarWidth = 0;
    rvarHeight = 0;
    Trapped(kClass, "IClientFormProcessor_GetComponentWidthAndHeightInTwips", [&] {
        const std::int32_t type =
            ComponentTypeName(rfrmActual) == "Form" ? ObjectType::kForm : ObjectType::kReport;
        const bool designView = late::IntegerOrZero(rfrmActual, "currentview") == 0;
        CorrectInsideWidthAndHeight(type, rfrmActual, designView);
        myDoevents();

        const platform::SystemMetrics& metrics = platform::Env().windows->Metrics();
        const Value width = late::PropertyOrNull(rfrmActual, "WindowWidth");
        const Value height = late::PropertyOrNull(rfrmActual, "WindowHeight");
        rvarWidth = Pixels(width.AsDouble(), metrics.twipsPerPixelX);
        rvarHeight = Pixels(height.AsDouble(), metrics.twipsPerPixelY);

        const std::int32_t window = late::IntegerOrZero(rfrmActual, "hWnd");
        if (type == ObjectType::kForm || rvarWidth == 0)
            TakeWindowSize(window, rvarWidth, rvarHeight);
        if (vfCaptureReportPreviewAreaOnly)
            TakeWindowSize(ChildWindow(window, "OPrtPrevPage"), rvarWidth, rvarHeight);

        ResetInsideWidthAndHeight(type, rfrmActual, designView);
        myDoevents();
    });
}

std::int32_t CN_IDEAccFormProcessor::GetComponentHwnd(std::int32_t, const HostObject&,
                                                      const HostObject& rfrmActual) {
    std::int32_t window = 0;
    Trapped(kClass, "IClientFormProcessor_GetComponentHwnd", [&] {
        window = late::Integer(rfrmActual, "hWnd");
        const CTovimarParameters* parameters = Session::Parameters();
        if (parameters == nullptr || !parameters->CapturePreviewAreaOnly)
            return;
        if (const std::int32_t page = ChildWindow(window, "OPrtPrevPage"))
            window = page;
    });
    return window;
}

} // namespace tovimar
