#include "screenshots/CFormBitmapCapture.h"

#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "screenshots/CaptureTrace.h"
#include "screenshots/cJPEG.h"

#include <functional>

namespace tovimar {

namespace {

constexpr std::int32_t kScreenshotQuality = 85;
constexpr std::int32_t kBitmapFormat = 1, kJpegFormat = 2;
constexpr int kDeepestWindow = 64;

using capture_trace::Line;
using capture_trace::Yes;
using platform::Window;

std::string UpToNul(const std::string& text) {
    return text.substr(0, text.find('\0'));
}

/// Depth first: a window, then what lies below it, then its next sibling.
std::int32_t FindBelow(std::int32_t parent, const std::function<bool(const Window&)>& fits, int depth = 0) {
    auto& windows = *platform::Env().windows;
    for (auto child = windows.FirstChild(parent); child != 0 && depth < kDeepestWindow;
         child = windows.NextSibling(child)) {
        if (const auto* window = windows.Find(child); window != nullptr && fits(*window))
            return child;
        if (const auto found = FindBelow(child, fits, depth + 1); found != 0)
            return found;
    }
    return 0;
}

std::string Described(const std::string& caption, std::int32_t width, std::int32_t height,
                      std::int32_t hwnd) {
    return caption + "], Width = " + std::to_string(width) + ", Height = " + std::to_string(height) +
           ", Hwnd = " + std::to_string(hwnd);
}

} // namespace

modScreenCapture::Picture CFormBitmapCapture::CaptureFormInDesignView(std::int32_t vlngHwnd,
                                                                      std::int32_t vlngScaleX,
                                                                      std::int32_t vlngScaleY) {
    modScreenCapture::Picture picture;
    PassOver(
        [&] { picture = modScreenCapture::CaptureWindow(vlngHwnd, false, 0, 0, vlngScaleX, vlngScaleY); });
    return picture;
}

std::int32_t CFormBitmapCapture::hwndForm(std::int32_t HWNDVBIDE, const std::string& CaptionToFind) {
    const auto caption = UpToNul(CaptionToFind);
    const auto found = FindBelow(HWNDVBIDE, [&](const Window& window) {
        return text::EqualsIgnoringCase(UpToNul(window.caption), caption);
    });
    return found != 0 ? found : platform::Env().windows->FindTopLevel("thunderform", caption);
}

std::int32_t CFormBitmapCapture::GetIDEChildWindowHwndByWinClassName(std::int32_t HWNDVBIDE,
                                                                     const std::string& vstrWinClassName) {
    return FindBelow(HWNDVBIDE, [&](const Window& window) {
        return text::EqualsIgnoringCase(window.className, vstrWinClassName);
    });
}

bool CFormBitmapCapture::CaptureWindowScreenshot(std::int32_t vlngHwnd, const std::string& vstrPicType,
                                                 const std::string& vstrPicFullPath) {
    if (vlngHwnd == 0)
        return false;
    const auto picture = modScreenCapture::CaptureWindowByHWND(vlngHwnd);
    if (picture == nullptr)
        return false;
    modScreenCapture::WritePictureToFile(picture, vstrPicType, vstrPicFullPath);
    return true;
}

std::int32_t CFormBitmapCapture::SavePictureErr(const modScreenCapture::Picture& Pic,
                                                const std::string& vstrPicFullPath,
                                                std::int32_t ImagesFormat) {
    if (Pic == nullptr)
        return -1;
    if (ImagesFormat == kJpegFormat) {
        cJPEG section;
        std::int32_t number = 0;
        std::string message;
        const auto path = text::ReplaceAllIgnoringCase(vstrPicFullPath, ".bmp", ".jpg");
        if (section.CreateFromPicture(*Pic) &&
            JPEG_Save(section, path, kScreenshotQuality, /*confirm=*/false, number, message))
            return kJpegFormat;
    }
    std::int32_t format = -1;
    Trapped(
        "CFormBitmapCapture", "SavePictureErr",
        [&] {
            platform::Env().files->WriteFile(vstrPicFullPath, platform::EncodeBmp(*Pic));
            format = kBitmapFormat;
        },
        [&] { return vstrPicFullPath; });
    return format;
}

bool CFormBitmapCapture::CaptureForm(const std::string& vstrPicType, const std::string& vstrPicFullPath,
                                     std::int32_t vlngHostAppIdeMainWindowHwnd, const std::string& caption,
                                     std::int32_t hwnd, std::int32_t width, std::int32_t height) {
    Line([&] { return "CaptureForm(1): WinCaption = [" + Described(caption, width, height, hwnd); });
    hwnd = GetWindowHwnd(vlngHostAppIdeMainWindowHwnd, caption, hwnd);
    Line([&] { return "CaptureForm(2): WinCaption = [" + Described(caption, width, height, hwnd); });
    if (hwnd == 0)
        return false;
    const auto picture = CaptureFormInDesignView(hwnd, width, height);
    Line([&] { return "CaptureForm(3): Pic is Nothing = " + Yes(picture == nullptr); });
    modScreenCapture::WritePictureToFile(picture, vstrPicType, vstrPicFullPath);
    return true;
}

bool CFormBitmapCapture::CaptureControl(const std::string& vstrPicType, const std::string& vstrPicFullPath,
                                        std::int32_t vlngHostAppIdeMainWindowHwnd, const std::string& caption,
                                        std::int32_t hwnd, std::int32_t left, std::int32_t top,
                                        std::int32_t width, std::int32_t height) {
    hwnd = GetWindowHwnd(vlngHostAppIdeMainWindowHwnd, caption, hwnd);
    if (hwnd == 0)
        return false;
    platform::Env().doEvents();
    const auto picture = modScreenCapture::CaptureWindow(hwnd, true, left, top, width, height);
    modScreenCapture::WritePictureToFile(picture, vstrPicType, vstrPicFullPath);
    return true;
}

std::int32_t CFormBitmapCapture::GetWindowHwnd(std::int32_t vlngHostAppMainWindowHwnd,
                                               const std::string& vstrComponentWindowCaption,
                                               std::int32_t vlngHwnd) {
    return vlngHwnd != 0 ? vlngHwnd : hwndForm(vlngHostAppMainWindowHwnd, vstrComponentWindowCaption);
}

} // namespace tovimar
