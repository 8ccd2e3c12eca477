#pragma once

#include "platform/Value.h"

#include <cstdint>
#include <string>

namespace tovimar {

class IClientFormProcessor;

/// Walks a live object of the host and writes what it finds as raw object XML: the layout of a definition,
/// positions in the units that the processor delivers. Keeps no state.
class CClientUIObjectRawXml {
public:
    /// The raw XML of an object; empty when the host can't open it or a failure was reported.
    /// Types 2 and 3 are opened and walked; 0, 1, 4, 81 and 82 go to `Get1_`. `component` is the host's
    /// catalogue entry, of which `Name` is read. Without `vfKeepOpen` the object is closed unsaved.
    std::string Get_(IClientFormProcessor& processor, std::int32_t objectType, const HostObject& component,
                     std::int32_t hostWindow, const std::string& sourceProjectTypeName = {},
                     const std::string& namePrefix = {}, bool vfKeepOpen = true,
                     bool vfCaptureReportPreviewArea = false);

    /// The raw XML of a table, query, macro, worksheet or chart: its fields as controls.
    std::string Get1_(IClientFormProcessor& processor, std::int32_t objectType, const HostObject& component,
                      const std::string& sourceProjectTypeName = {}, const std::string& namePrefix = {});
};

} // namespace tovimar
