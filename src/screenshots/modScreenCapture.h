#pragma once

#include "platform/imaging/Bitmap.h"
#include "platform/windowing/WindowSystem.h"

#include <memory>
#include <string>

/// Pictures of windows and their files. Every operation reports its failures as module "ScreenCapture" and
/// then gives nothing or leaves the file unwritten. The steps of a capture are traced under verbose tracing.
namespace tovimar::modScreenCapture {

/// A captured picture; null stands for none.
using Picture = std::shared_ptr<const platform::Bitmap>;

/// Kinds of image by their text.
inline constexpr const char* kBmp = "bmp";
inline constexpr const char* kJpg = "jpg";

/// Pixels of a rectangle: in client coordinates with `Client`, else in those of the whole window, frame
/// included. Parts outside the window, and a window that is gone, are black.
Picture CaptureWindow(platform::WindowHandle hWndSrc, bool Client, int LeftSrc, int TopSrc, int WidthSrc,
                      int HeightSrc);
/// Null for an empty bitmap.
Picture CreateBitmapPicture(Picture hBmp);
/// The whole window.
Picture CaptureWindowByHWND(platform::WindowHandle hWnd);
/// `PicType` "bmp" or "jpg" (at quality 100), without regard to case. An empty path does nothing.
void WritePictureToFile(const Picture& Pic, const std::string& PicType, const std::string& FileFullPath);

} // namespace tovimar::modScreenCapture
