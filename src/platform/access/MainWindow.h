#pragma once

#include "platform/windowing/WindowSystem.h"

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

    Bitmap Paint() override {
        constexpr std::uint32_t kWorkArea = 0x00ABABAB;
        Bitmap bitmap{rectangle.Width(), rectangle.Height(), {}};
        bitmap.pixels.assign(static_cast<std::size_t>(bitmap.width) * static_cast<std::size_t>(bitmap.height),
                             kWorkArea);
        return bitmap;
    }
};

} // namespace tovimar::platform::access
