#include "screenshots/Screenshot.h"

#include "foundation/BackupFileName.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "generation/RunProgress.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/files/Paths.h"
#include "screenshots/CFormBitmapCapture.h"
#include "screenshots/ScreenshotRecord.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {

namespace {

constexpr const char* kClass = "Screenshot";

} // namespace

Screenshot::Screenshot() = default;

Screenshot::~Screenshot() {
    if (ownServer_)
        ForgetServer();
}

ResultCode Screenshot::TakeWindowScreenshot(std::int32_t vlngHwnd, std::int32_t picType,
                                            const std::string& targetFolder,
                                            const std::string& picFileNameExt) {
    if (const auto code = CheckPlace(picType, targetFolder, picFileNameExt); code != kSuccess)
        return code;
    bool taken = false;
    const auto failed = Guarded("TakeWindowScreenshot", [&] {
        takenImageFullPath_ = platform::Join(targetFolder, picFileNameExt);
        taken = CFormBitmapCapture().CaptureWindowScreenshot(
            vlngHwnd, picType == 1 ? modScreenCapture::kBmp : modScreenCapture::kJpg, takenImageFullPath_);
    });
    if (failed == kSuccess && !taken)
        return Fail(kGeneralFailure, "Unexpected error whille taking window screenshot.");
    return failed;
}

std::unique_ptr<CXmlForm> Screenshot::TakePictures(const Shot& shot) {
    auto& generator = *Session::Generator();
    const auto& parameters = generator.Parameters();
    const std::string folder = platform::FolderOf(shot.picFullPath);
    const std::string picture = shot.picFullPath.empty() ? shot.picFullPath
                                                         : folder + platform::BaseNameOf(shot.picFullPath) +
                                                               parameters.ImagesFileExt();
    auto form = generator.CreateNormalizedXmlDef(shot.objectType, shot.objectName, 0, shot.designView,
                                                 /*vfReplaceHtml=*/false, parameters.ImagesFormat, picture,
                                                 shot.htmlFullPath, parameters.CapturePreviewAreaOnly, {},
                                                 /*vfKeepOpened=*/true);
    // What kept the host from describing the object has been reported there.
    if (form->Name.empty()) {
        Fail(kFailure1, "There is no description of the object [" + shot.objectName + "].");
        return nullptr;
    }
    if (LocateObjectsAndTakeScreenshots(parameters.ImagesType(), shot.window, form->XMLSTr(),
                                        shot.picsFolder.empty() ? folder : shot.picsFolder) != kSuccess)
        return nullptr;
    return form;
}

ResultCode Screenshot::WriteTopic(CXmlForm& form, const Shot& shot, bool zoomed) {
    const auto& parameters = *Session::Parameters();
    if (form.StylesheetFullPath().empty())
        form.SetStylesheetFullPath(parameters.CSSFullPath());
    if (form.Charset.empty())
        form.Charset = parameters.Charset;
    if (shot.htmlFullPath.empty())
        return kSuccess;
    const std::string folder =
        shot.picsFolder.empty() ? platform::FolderOf(shot.picFullPath) : shot.picsFolder;
    return form.SaveHTMLEx(shot.htmlFullPath, /*HtmlOfReport=*/shot.objectType != ObjectType::kForm, zoomed,
                           /*vfUseLocalImagePath=*/false, folder);
}

ResultCode Screenshot::TakeScreenshot(std::int32_t objectType, const std::string& objectName,
                                      const std::string& picFullPath, const std::string& htmlFullPath,
                                      bool vfIsVSNet, const std::string& picsFolder) {
    ResultCode result = kSuccess;
    const auto failed = Guarded("TakeScreenshot", [&] {
        if (!vfIsVSNet && (objectName.empty() || !HostAgent().ComponentExistsTest(objectType, objectName)))
            throw RaisedError(
                kFailure1, "Undefined object type and name (" + std::to_string(objectType) + objectName + ")",
                "Screenshot.TakeScreenshot");
        Shot shot{objectType, objectName, picFullPath, htmlFullPath, picsFolder};
        const auto form = TakePictures(shot);
        if (form == nullptr) {
            result = lastErrNum_;
            return;
        }
        if (!htmlFullPath.empty() && !BackUpFile(htmlFullPath)) {
            result = Fail(kFailure2, "Cannot backup active object's HTML file '" + htmlFullPath + "'.");
            ShowMessage(lastErrDscr_, kMsgExclamation, kApplicationTitle, {}, 0, "Screenshot.TakeScreenshot");
            return;
        }
        result = WriteTopic(*form, shot, /*zoomed=*/true);
    });
    return failed != kSuccess ? failed : result;
}

ResultCode Screenshot::Fail(ResultCode number, const std::string& text) {
    lastErrNum_ = number;
    lastErrDscr_ = text;
    return number;
}

ResultCode Screenshot::Guarded(const char* operation, const std::function<void()>& steps) {
    Fail(kSuccess, {});
    std::string text;
    const auto failed = Trapped(kClass, operation, [&] {
        try {
            steps();
        } catch (const std::exception& failure) {
            text = failure.what();
            throw;
        }
    });
    return failed == kSuccess ? kSuccess : Fail(failed, text);
}

std::string Screenshot::LastErrStr() const {
    return lastErrNum_ == 0 ? std::string() : std::to_string(lastErrNum_) + " - " + lastErrDscr_;
}

} // namespace tovimar
