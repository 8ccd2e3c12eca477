#pragma once

#include "platform/windowing/WindowSystem.h"

#include <cmath>
#include <string>

namespace tovimar::platform::access {

/// The host's main window, class "OMain": the parent of all its windows, which are captured one by one. Its
/// own picture is an empty work area.
class MainWindow : public Window {
public:
    explicit MainWindow(const std::string& title) {
        className = "OMain";
        caption = title;
        rectangle = {0, 0, 1024, 768};
        client = {0, 0, 1024, 768};
    }

    Bitmap Paint(double scale) override {
        constexpr std::uint32_t kWorkArea = 0x00ABABAB;
        const auto device = [scale](int value) { return static_cast<int>(std::lround(value * scale)); };
        Bitmap bitmap{device(rectangle.Width()), device(rectangle.Height()), {}};
        bitmap.pixels.assign(static_cast<std::size_t>(bitmap.width) * static_cast<std::size_t>(bitmap.height),
                             kWorkArea);
        return bitmap;
    }
};

} // namespace tovimar::platform::access
