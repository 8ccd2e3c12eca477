// The pictures of one object: its window and the controls that have a picture of their own.

#include "screenshots/Screenshot.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "screenshots/CFormBitmapCapture.h"
#include "screenshots/CaptureTrace.h"
#include "uimodel/CXmlControl.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {

namespace {

constexpr const char* kClass = "Screenshot";

std::int32_t ObjectTypeOf(const CXmlForm& form) {
    return text::EqualsIgnoringCase(form.ClassName, "Report") ? ObjectType::kReport : ObjectType::kForm;
}

/// What a picture shows above its control, so that the title in the frame's line is seen. The topic's map
/// counts it as well.
std::int32_t TitleShare(const CXmlControl& control) {
    if (control.IsClass("Frame") || control.IsClass("OptionGroup"))
        return 8;
    if (control.IsClass("TabControl") || control.IsClass("Page") || control.IsClass("SSTab"))
        return 2;
    return 0;
}

bool Runtime() {
    const auto* data = Session::ServerData();
    return data != nullptr && data->Runtime;
}

CTovimarServerAgent& Agent() {
    auto* agent = Session::ServerAgent();
    if (agent == nullptr)
        throw RaisedError(kGeneralFailure, "There is no connection to a host.", kClass);
    return *agent;
}

/// What a control is called in the host's command that activates it.
std::string FullPath(const CXmlControl& control, const std::string& parentPath) {
    const std::string path = parentPath + control.ControlType() + "." + control.Name;
    return control.IsClass("Page") && control.TabPageIndex >= 0
               ? path + ".[" + std::to_string(control.TabPageIndex) + "]"
               : path;
}

std::string InFolder(const std::string& folder, const std::string& path) {
    return folder.empty() ? path : platform::Join(folder, platform::FileNameOf(path));
}

} // namespace

/// One call's wishes, and what all its captures share.
struct Screenshot::Request {
    const std::string& picType;
    const std::string& folder;
    std::int32_t window;
    const CXmlForm& form;
    bool msAccess;
    std::int32_t mainWindow; ///< only looked for where there is no window's handle
};

ResultCode Screenshot::LocateObjectsAndTakeScreenshots(const std::string& vstrPicType, std::int32_t vlngHwnd,
                                                       const std::string& vstrXml,
                                                       const std::string& vstrPicsFolder) {
    return Guarded("LocateObjectsAndTakeScreenshots", [&] {
        CXmlForm form;
        if (const auto code = form.LoadXml(vstrXml); code != kSuccess)
            throw RaisedError(code, "Error parsing XML form string",
                              "Screenshot.LocateObjectsAndTakeScreenshots");
        TakeAll(vstrPicType, vlngHwnd, form, vstrPicsFolder);
    });
}

ResultCode Screenshot::LocateObjectsAndTakeScreenshots(const std::string& vstrPicType, std::int32_t vlngHwnd,
                                                       CXmlForm& form, const std::string& vstrPicsFolder) {
    return Guarded("LocateObjectsAndTakeScreenshots",
                   [&] { TakeAll(vstrPicType, vlngHwnd, form, vstrPicsFolder); });
}

void Screenshot::TakeAll(const std::string& vstrPicType, std::int32_t vlngHwnd, CXmlForm& form,
                         const std::string& vstrPicsFolder) {
    const auto type = ObjectTypeOf(form);
    auto& agent = Agent();
    const auto window = agent.ActivateComponent(type, form.Name, /*forceOpenInDesignView=*/false,
                                                /*forceOpenAsHidden=*/false);
    agent.CorrectInsideWidthAndHeigh(type, form.Name, /*designViewFlag=*/true);
    const auto captured = vlngHwnd != 0 ? vlngHwnd : window;
    const Request request{vstrPicType,
                          vstrPicsFolder,
                          captured,
                          form,
                          text::EqualsIgnoringCase(form.SourceProjectType, SourceProjectKind::kMSAccess),
                          captured == 0 ? agent.HostAppMainWindowHWnd() : 0};
    // The window gets its size back whatever happened.
    try {
        TakeForm(request, form);
        const auto path = form.ClassName + "." + form.Name + ".";
        for (const auto& control : form.Controls)
            TakeControl(request, *control, path);
    } catch (const RaisedError&) {
        PassOver([&] { agent.ResetInsideWidthAndHeigh(type, form.Name, true); });
        throw;
    }
    agent.ResetInsideWidthAndHeigh(type, form.Name, /*designViewFlag=*/true);
}

void Screenshot::TakeForm(const Request& request, CXmlForm& form) {
    const auto own = form.PicFullPath();
    if (own.empty())
        return;
    const auto path = InFolder(request.folder, own);
    capture_trace::Line([&] {
        return "TakeFormAndCompoundControlsScreenshots: Form = [" + form.Name + "], picFullPath = " + path;
    });
    if (CFormBitmapCapture().CaptureForm(request.picType, path, request.mainWindow, form.Caption(),
                                         request.window, form.Width, form.Height))
        takenImageFullPath_ = path;
    form.SetPicFullPath(path);
}

void Screenshot::TakeControl(const Request& request, CXmlControl& control, const std::string& parentPath) {
    const std::string path = FullPath(control, parentPath);
    TakeControlPicture(request, control);
    for (const auto& child : control.Controls) {
        if (text::EqualsIgnoringCase(child->ControlType(), "Page"))
            Agent().ActivateControl(FullPath(*child, path + "."), Runtime(), /*setFocusFlag=*/false);
        TakeControl(request, *child, path + ".");
    }
    if (control.IsTabControl())
        Agent().ActivateControl(path + ".Page." + control.Name + ".[0]", Runtime(), /*setFocusFlag=*/false);
}

void Screenshot::TakeControlPicture(const Request& request, CXmlControl& control) {
    if (control.PicFullPath.empty())
        return;
    const auto path = InFolder(request.folder, control.PicFullPath);
    const auto share = request.msAccess ? TitleShare(control) : 0;
    CFormBitmapCapture().CaptureControl(request.picType, path, request.mainWindow, request.form.Caption(),
                                        request.window, control.Left, control.Top - share, control.Width,
                                        control.Height + share);
    control.PicFullPath = path;
}

} // namespace tovimar
