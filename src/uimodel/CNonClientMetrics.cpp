#include "uimodel/CNonClientMetrics.h"

#include "platform/Environment.h"
#include "platform/windowing/WindowSystem.h"

namespace tovimar {

void CNonClientMetrics::SearchMetrics() {
    const platform::SystemMetrics& metrics = platform::Env().windows->Metrics();
    MaxHeight = metrics.captionHeight;
    MinHeight = metrics.smallCaptionHeight;
    HeightMenus = metrics.menuHeight;
    borderWidth = metrics.borderWidth;
    ScrollWidth = metrics.scrollWidth;
    ScrollHeight = metrics.scrollHeight;
}

std::int32_t CNonClientMetrics::GetFormNCM(std::int32_t vlngBorderStyle) const {
    switch (vlngBorderStyle) {
    case 1:
    case 2:
    case 3:
        return MaxHeight;
    case 4:
    case 5:
        return MinHeight;
    default:
        return 0;
    }
}

} // namespace tovimar
