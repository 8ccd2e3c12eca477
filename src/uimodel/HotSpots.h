#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

/// What the window frames of a Windows version take off every hot spot, pixels.
struct FrameCorrection {
    std::int32_t x = 0;
    std::int32_t y = 0;
    friend bool operator==(const FrameCorrection&, const FrameCorrection&) = default;
};

/// Versions below 6 have square frames and need none. From 6 on it depends on the kind of source project.
FrameCorrection CorrectionOfFrames(std::int32_t windowsMajorVersion,
                                   const std::string& sourceProjectTypeName);

} // namespace tovimar
