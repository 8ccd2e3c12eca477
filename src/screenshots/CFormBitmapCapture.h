#pragma once

#include "screenshots/modScreenCapture.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// Finds the window to capture and takes its picture. Windows are those of the environment's window system.
class CFormBitmapCapture {
public:
    /// The window with its frame, from its top left corner, in pixels; null when that fails.
    modScreenCapture::Picture CaptureFormInDesignView(std::int32_t vlngHwnd, std::int32_t vlngScaleX,
                                                      std::int32_t vlngScaleY);
    /// The window with that caption below the host's main window, depth first, else a top-level window of
    /// class "thunderform"; 0 for none. Captions compare without regard to case, up to a NUL.
    std::int32_t hwndForm(std::int32_t HWNDVBIDE, const std::string& CaptionToFind);
    /// The first window of that class below the host's main window, depth first; 0 for none.
    std::int32_t GetIDEChildWindowHwndByWinClassName(std::int32_t HWNDVBIDE,
                                                     const std::string& vstrWinClassName);
    /// Writes the whole window's picture; `vstrPicType` is "bmp" or "jpg". False for a handle of 0 or a
    /// window without a picture.
    bool CaptureWindowScreenshot(std::int32_t vlngHwnd, const std::string& vstrPicType,
                                 const std::string& vstrPicFullPath);
    /// Writes by `ImagesFormat`: 2 a JPEG at quality 85 under the path with ".jpg" for ".bmp", anything
    /// else, or a JPEG that failed, a bitmap. Gives the format written (1 or 2), -1 for none.
    std::int32_t SavePictureErr(const modScreenCapture::Picture& Pic, const std::string& vstrPicFullPath,
                                std::int32_t ImagesFormat);

    /// A form's window into a file, found by caption when the handle is 0. False when it isn't there.
    bool CaptureForm(const std::string& vstrPicType, const std::string& vstrPicFullPath,
                     std::int32_t vlngHostAppIdeMainWindowHwnd, const std::string& caption, std::int32_t hwnd,
                     std::int32_t width, std::int32_t height);
    /// A rectangle of a form's client area into a file, in pixels of the client area.
    bool CaptureControl(const std::string& vstrPicType, const std::string& vstrPicFullPath,
                        std::int32_t vlngHostAppIdeMainWindowHwnd, const std::string& caption,
                        std::int32_t hwnd, std::int32_t left, std::int32_t top, std::int32_t width,
                        std::int32_t height);
    /// The given handle, or the window with the caption when it is 0.
    std::int32_t GetWindowHwnd(std::int32_t vlngHostAppMainWindowHwnd,
                               const std::string& vstrComponentWindowCaption, std::int32_t vlngHwnd = 0);
};

} // namespace tovimar
