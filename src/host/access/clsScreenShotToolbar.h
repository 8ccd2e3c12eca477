#pragma once

#include "platform/AutomationObject.h"

#include <string>

namespace tovimar {

/// The host's small toolbar of the screenshot tool: one button with a text.
class clsScreenShotToolbar {
public:
    /// The toolbar of the product, whatever name a command carries.
    static constexpr const char* kName = "Vasmora Screenshot";

    /// Makes the toolbar when there is none of that name, and brings it up.
    void Show(const HostObject& rapp, const std::string& vstrToolbarName);
    /// Removes it; nothing when there is none.
    void Delete(const HostObject& rapp, const std::string& vstrToolbarName);
};

} // namespace tovimar
