#pragma once

#include <algorithm>
#include <cstdint>
#include <limits>

namespace tovimar {

/// Sum of coordinates, which are foreign input: it ends at the greatest number instead of running over.
constexpr std::int32_t SaturatedSum(std::int64_t left, std::int64_t right) {
    return static_cast<std::int32_t>(std::clamp<std::int64_t>(
        left + right, std::numeric_limits<std::int32_t>::min(), std::numeric_limits<std::int32_t>::max()));
}

} // namespace tovimar
