// The commands that make pictures and pages of their own.
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "host/access/AccessCatalogue.h"
#include "host/access/AccessProject.h"
#include "host/access/CN_IDEAccContext.h"
#include "host/access/LateBound.h"
#include "host/contract/ObjectTypes.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/windowing/WindowSystem.h"
#include "screenshots/CFormBitmapCapture.h"
#include "screenshots/Screenshot.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CN_IDEAccContext";
constexpr ResultCode kNotAvailableNow = 2046;
constexpr std::int32_t kOpenRelationships = 133;
constexpr const char* kRelationshipsClass = "OSysRel";

void ReportDatamodelFailure(const RaisedError& failure) {
    if (failure.Number() == kNotAvailableNow)
        ShowMessage("The command or action 'Relationships' isn't available now (Err# 2046).", kMsgExclamation,
                    "Tovimar Add-In");
    else
        ReportError(failure, kClass, "ScreenshotDatamodelWindow");
}

} // namespace

std::string CN_IDEAccContext::GetQueryXmlDescription(const HostObject& rapp,
                                                     const std::string& vstrQueryName) {
    return access_catalogue::QueryXml(rapp, vstrQueryName);
}

// Without a picture the list of relations is still worth its page.
std::string CN_IDEAccContext::ScreenshotDatamodelWindow() {
    if (CurrentSourceProjectIsADPorADE() ||
        late::Count(late::Object(late::Object(application_, "CurrentDb"), "Relations")) == 0)
        return {};
    const std::int32_t mainWindow = HostAppMainWindowHWnd();
    CFormBitmapCapture capture;
    const auto find = [&] {
        return capture.GetIDEChildWindowHwndByWinClassName(mainWindow, kRelationshipsClass);
    };
    try {
        std::int32_t window = find();
        if (window == 0) {
            late::Call(late::Object(application_, "DoCmd"), "RunCommand", {kOpenRelationships});
            myDoevents();
            window = find();
        }
        const CTovimarParameters* parameters = Session::Parameters();
        if (window != 0 && parameters != nullptr) {
            capture.CaptureWindowScreenshot(window, parameters->ImagesType(),
                                            parameters->FolderForGeneratedImages() + "Datamodel" +
                                                parameters->ImagesFileExt());
            platform::Env().windows->Close(window);
        }
    } catch (const RaisedError& failure) {
        ReportDatamodelFailure(failure);
    }
    return access_catalogue::RelationsHtml(application_);
}

void CN_IDEAccContext::TakeScreenshot(std::int32_t type, const std::string& name, const std::string& picPath,
                                      const std::string& htmlPath) {
    CTovimar generator;
    generator.SetParameters(Session::Parameters()->Clone());
    const CTovimarParameters& parameters = generator.Parameters();
    const bool isReport = type != ObjectType::kForm;
    const HostObject open = late::Object(application_, isReport ? "Reports" : "Forms", {name});
    const bool designView = !isReport && late::Integer(open, "currentview") == 0;
    const std::string picture =
        picPath.empty()
            ? picPath
            : platform::FolderOf(picPath) + platform::BaseNameOf(picPath) + parameters.ImagesFileExt();

    const std::unique_ptr<CXmlForm> form = generator.CreateNormalizedXmlDef(
        type, name, HostAppMainWindowHWnd(), designView, /*vfReplaceHtml=*/false, parameters.ImagesFormat,
        picture, htmlPath, parameters.CapturePreviewAreaOnly, CurrentSourceProjectTypeName(),
        /*vfKeepOpened=*/true);
    if (!form || Screenshot().LocateObjectsAndTakeScreenshots(
                     parameters.ImagesType(), late::Integer(open, "hWnd"), form->XMLSTr()) != kSuccess)
        return;
    if (form->StylesheetFullPath().empty())
        form->SetStylesheetFullPath(parameters.CSSFullPath());
    if (form->Charset.empty())
        form->Charset = parameters.Charset;
    if (!htmlPath.empty())
        form->SaveHTMLEx(htmlPath, isReport, /*vfApplyZoomFactor=*/false, /*vfUseLocalImagePath=*/true,
                         platform::FolderOf(picture));
}

} // namespace tovimar
