#include "screenshots/modScreenCapture.h"

#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/imaging/Jpeg.h"
#include "platform/text/Text.h"
#include "screenshots/CaptureTrace.h"
#include "screenshots/cJPEG.h"

#include <utility>

namespace tovimar::modScreenCapture {

namespace {

constexpr const char* kModule = "ScreenCapture";
constexpr int kBestQuality = 100;

using capture_trace::Line;
using capture_trace::Yes;

double Scale() {
    const auto* parameters = Session::Parameters();
    return parameters == nullptr ? 1 : parameters->ImagesScale;
}

/// The steps that a capture has on a display without a palette.
void TraceCapture(platform::WindowHandle window, bool captured) {
    const auto handle = std::to_string(window);
    Line([&] { return "CaptureWindow(1), hDCSrc = " + handle; });
    Line([&] { return "CaptureWindow(2), hDCMemory = " + handle; });
    Line([&] { return "CaptureWindow(3), hBmp = " + handle + ", hBmpPrev = 0"; });
    Line([] {
        return std::string(
            "CaptureWindow(4), RasterCapsScrn = 0, HasPaletteScrn = False, PaletteSizeScrn = 0");
    });
    Line([&] { return "CaptureWindow(7), lngRet = " + std::string(captured ? "1" : "0"); });
    Line([&] { return "CaptureWindow(8), hBmp = " + handle; });
    Line([] { return std::string("CaptureWindow(10), lngRet = 1"); });
    Line([] { return std::string("CaptureWindow(11), lngRet = 1"); });
}

void WriteJpeg(const platform::Bitmap& picture, const std::string& path) {
    // Straight from the captured pixels: a section in between would only copy them.
    std::string bytes;
    if (const int code = platform::EncodeJpeg(picture, kBestQuality, bytes); code != platform::JpegCode::kOk)
        throw RaisedError(code, "ijlWrite Error - " + JPEG_ErrorText(code), kModule);
    platform::Env().files->WriteFile(path, bytes);
}

void WritePicture(const platform::Bitmap& picture, const std::string& type, const std::string& path) {
    if (text::EqualsIgnoringCase(type, kBmp))
        platform::Env().files->WriteFile(path, platform::EncodeBmp(picture));
    else if (text::EqualsIgnoringCase(type, kJpg))
        WriteJpeg(picture, path);
}

void TraceFile(const std::string& path) {
    Line([&] {
        return "WritePictureToFile(1): Pic = " + path +
               ", FileExists = " + Yes(platform::Env().files->FileExists(path));
    });
}

} // namespace

Picture CaptureWindow(platform::WindowHandle hWndSrc, bool Client, int LeftSrc, int TopSrc, int WidthSrc,
                      int HeightSrc) {
    Picture result;
    Trapped(kModule, "CaptureWindow", [&] {
        auto bitmap =
            platform::Env().windows->Capture(hWndSrc, Client, LeftSrc, TopSrc, WidthSrc, HeightSrc, Scale());
        const bool captured = bitmap != nullptr && !bitmap->Empty();
        // A window that is gone still yields a picture of its size.
        if (!captured && WidthSrc > 0 && HeightSrc > 0)
            bitmap = std::make_shared<const platform::Bitmap>(platform::BlackBitmap(WidthSrc, HeightSrc));
        TraceCapture(hWndSrc, captured);
        result = CreateBitmapPicture(std::move(bitmap));
        Line([&] { return "CaptureWindow(12), objPic is nothing " + Yes(result == nullptr); });
    });
    return result;
}

Picture CreateBitmapPicture(Picture hBmp) {
    Picture result;
    if (hBmp != nullptr && !hBmp->Empty())
        result = std::move(hBmp);
    Line([&] { return "CreateBitmapPicture(1), lngRet = " + std::string(result ? "0" : "-1"); });
    return result;
}

Picture CaptureWindowByHWND(platform::WindowHandle hWnd) {
    Picture result;
    Trapped(kModule, "CaptureWindowByHWND", [&] {
        const auto* window = platform::Env().windows->Find(hWnd);
        const auto area = window == nullptr ? platform::Rectangle{} : window->rectangle;
        Line([&] {
            return "CaptureWindowByHWND(1), ret = " + std::string(window == nullptr ? "0" : "1") +
                   ", top = " + std::to_string(area.top) + ", left = " + std::to_string(area.left) +
                   ", bottom = " + std::to_string(area.bottom) + ", right = " + std::to_string(area.right);
        });
        result = CaptureWindow(hWnd, false, 0, 0, area.Width(), area.Height());
        Line([&] { return "CaptureWindowByHWND(2), pic is Nothing = " + Yes(result == nullptr); });
        if (result != nullptr)
            Line([&] {
                return "CaptureWindowByHWND(3), type = 1, width = " + std::to_string(result->width) +
                       ", height = " + std::to_string(result->height) + ", handle = " + std::to_string(hWnd);
            });
    });
    return result;
}

void WritePictureToFile(const Picture& Pic, const std::string& PicType, const std::string& FileFullPath) {
    if (FileFullPath.empty() || Pic == nullptr)
        return;
    TraceFile(FileFullPath);
    std::string description;
    const auto failed = Trapped(
        kModule, "WritePictureToFile",
        [&] {
            try {
                WritePicture(*Pic, PicType, FileFullPath);
            } catch (const std::exception& failure) {
                description = failure.what();
                throw;
            }
        },
        [&] { return FileFullPath; });
    Line([&] {
        return "WritePictureToFile(2): Pic = " + FileFullPath +
               ", FileExists = " + Yes(platform::Env().files->FileExists(FileFullPath)) +
               ", ErrNum = " + std::to_string(failed) + ", Errdesc = " + description;
    });
}

} // namespace tovimar::modScreenCapture
