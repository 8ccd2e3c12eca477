#pragma once

#include "platform/imaging/Bitmap.h"

#include <cstdint>
#include <map>
#include <memory>
#include <string>

/// The window system that the host application lives in: windows with handle, class, caption, rectangle
/// and parent, which paint themselves when they are captured. No display is needed.
namespace tovimar::platform {

using WindowHandle = std::int32_t;

/// Pixels; right and bottom lie outside.
struct Rectangle {
    int left = 0, top = 0, right = 0, bottom = 0;
    int Width() const { return right - left; }
    int Height() const { return bottom - top; }
    friend bool operator==(const Rectangle&, const Rectangle&) = default;
};

/// Metrics of this window system, in pixels at 96 dpi. They are its own: the frame of every window, the
/// scroll bars and captions are painted by them.
struct SystemMetrics {
    int borderWidth = 1;
    int scrollWidth = 17;
    int scrollHeight = 17;
    int captionHeight = 18;
    int smallCaptionHeight = 17;
    int menuHeight = 19;
    int twipsPerPixelX = 15;
    int twipsPerPixelY = 15;
};

class Window {
public:
    virtual ~Window() = default;
    /// The whole window, frame included; a bitmap of Width x Height of its rectangle, each times `scale`, at
    /// least 1, and rounded.
    virtual Bitmap Paint(double scale) = 0;
    /// Brings caption and rectangles up to date with what the window shows; True when a picture painted
    /// before is out of date. Asked before the window is handed out or captured.
    virtual bool Refresh() { return false; }

    WindowHandle handle = 0;
    WindowHandle parent = 0;
    std::string className;
    std::string caption;
    Rectangle rectangle; ///< in screen coordinates, frame included
    Rectangle client;    ///< client area relative to the window's top left corner
};

class WindowSystem {
public:
    WindowSystem();
    ~WindowSystem();

    const SystemMetrics& Metrics() const { return metrics_; }
    /// Below 6: windows have square frames without a shadow, so hot spots need no correction.
    std::int32_t WindowsMajorVersion() const { return 5; }

    /// Takes the window over, gives it a fresh handle and places it last below its parent.
    WindowHandle Open(std::unique_ptr<Window> window);
    /// Closes the window and all windows below it; an unknown handle does nothing.
    void Close(WindowHandle handle);
    Window* Find(WindowHandle handle);

    /// First child in order, 0 for none.
    WindowHandle FirstChild(WindowHandle parent);
    WindowHandle NextSibling(WindowHandle handle);
    /// Top-level window of that class and caption (ignoring case), 0 for none. Empty matches all.
    WindowHandle FindTopLevel(const std::string& className, const std::string& caption);

    /// Pixels of the rectangle, in window coordinates, or in client coordinates when `client` is set.
    /// Parts outside the window are black. An unknown handle gives null. With a `scale` other
    /// than 1 every pixel of the window becomes that many of the bitmap each way, painted sharp at that size;
    /// a window that would need more than 48 million pixels is painted at a lower scale, 1 at the least. The
    /// window is painted once and the picture kept until the window changes (`Invalidate`).
    /// The picture of a whole window isn't copied.
    std::shared_ptr<const Bitmap> Capture(WindowHandle handle, bool client, int left, int top, int width,
                                          int height, double scale = 1);
    /// The next capture paints the window anew.
    void Invalidate(WindowHandle handle);

private:
    SystemMetrics metrics_;
    WindowHandle next_ = 0x10001;
    std::map<WindowHandle, std::unique_ptr<Window>> windows_; // handles grow, so order is z-order
    struct Painted {
        WindowHandle handle = 0;
        double scale = 1;
        std::shared_ptr<const Bitmap> bitmap;
    } painted_;
};

} // namespace tovimar::platform
