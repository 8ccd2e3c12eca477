// The commands that make pictures and pages of their own.
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "host/access/AccessCatalogue.h"
#include "host/access/AccessProject.h"
#include "host/access/CN_IDEAccContext.h"
#include "host/access/LateBound.h"
#include "host/contract/ObjectTypes.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "platform/windowing/WindowSystem.h"
#include "screenshots/CFormBitmapCapture.h"
#include "screenshots/Screenshot.h"
#include "uimodel/CXmlForm.h"

#include <functional>

namespace tovimar {
namespace {

constexpr const char* kClass = "CN_IDEAccContext";
constexpr ResultCode kNotAvailableNow = 2046;
constexpr std::int32_t kOpenRelationships = 133;
constexpr const char* kRelationshipsClass = "OSysRel";

/// A step that fails is told, and the ones behind it are done all the same.
void DatamodelStep(const std::function<void()>& step) {
    try {
        step();
    } catch (const RaisedError& failure) {
        if (failure.Number() == kNotAvailableNow)
            ShowMessage("The command or action 'Relationships' isn't available now (Err# 2046).",
                        kMsgExclamation, kApplicationTitle);
        else
            ReportError(failure, kClass, "ScreenshotDatamodelWindow");
    }
}

void CaptureDatamodel(CFormBitmapCapture& capture, std::int32_t window) {
    if (const CTovimarParameters* parameters = Session::Parameters())
        capture.CaptureWindowScreenshot(window, parameters->ImagesType(),
                                        parameters->FolderForGeneratedImages() + "Datamodel" +
                                            parameters->ImagesFileExt());
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
    std::int32_t window = find();
    if (window == 0) {
        DatamodelStep(
            [this] { late::Call(late::Object(application_, "DoCmd"), "RunCommand", {kOpenRelationships}); });
        myDoevents();
        window = find();
    }
    if (window != 0) {
        myDoevents();
        DatamodelStep([&] { CaptureDatamodel(capture, window); });
        DatamodelStep([&] { platform::Env().windows->Close(window); });
    }
    return access_catalogue::RelationsHtml(application_);
}

void CN_IDEAccContext::TakeScreenshot(std::int32_t type, const std::string& name, const std::string& picPath,
                                      const std::string& htmlPath) {
    const bool isReport = type != ObjectType::kForm;
    const HostObject open = late::Object(application_, isReport ? "Reports" : "Forms", {name});
    Screenshot::Shot shot{type, name, picPath, htmlPath};
    shot.designView = !isReport && late::Integer(open, "currentview") == 0;
    if (const auto form = Screenshot().TakePictures(shot))
        Screenshot::WriteTopic(*form, shot, /*zoomed=*/false);
}

} // namespace tovimar
