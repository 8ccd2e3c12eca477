#pragma once

#include <cstdint>

namespace tovimar {

/// Metrics of a window's frame, in pixels, as the window system gives them.
class CNonClientMetrics {
public:
    std::int32_t MaxHeight = 0; ///< caption
    std::int32_t MinHeight = 0; ///< small caption
    std::int32_t HeightMenus = 0;
    std::int32_t borderWidth = 0;
    std::int32_t ScrollWidth = 0;
    std::int32_t ScrollHeight = 0;

    /// Reads the metrics.
    void SearchMetrics();
    /// Title height by border style: 0 none, 1 to 3 a caption, 4 and 5 a small one, others 0.
    std::int32_t GetFormNCM(std::int32_t vlngBorderStyle) const;
};

} // namespace tovimar
