#pragma once

#include <cstdint>

namespace tovimar {

/// What a run made, for its closing message.
class CTovimarStats {
public:
    std::int32_t HelpPagesQty = 0;
    std::int32_t ControlSectionsQty = 0;
    std::int32_t ScreenshotsQty = 0;
    std::int32_t FormHelpContextIdsQty = 0;
    std::int32_t ReportHelpContextIdsQty = 0;
    std::int32_t HelpProvidersQty = 0;
    std::int32_t IndexEntriesQty = 0;

    void Reset() { *this = CTovimarStats(); }
};

} // namespace tovimar
