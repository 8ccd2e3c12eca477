#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

/// The help viewer as the system uses it.
class clsHtmlHelp {
public:
    /// Shows the contents of a compiled help file.
    static void OpenTOC(const std::string& vstrHelpFullPath, std::int32_t vlngCallerHWND = 0);
    /// Closes every window that was opened, so that no help file stays locked.
    static void CloseAll();
};

} // namespace tovimar
