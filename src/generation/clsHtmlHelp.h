#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace tovimar {

/// The help viewer as the system uses it: opens help files and keeps a list of the windows that came of it,
/// so that they can be closed before a file is written anew. One for each connection, held by the server
/// data; its end closes its windows.
///
/// An empty path stands for the default help file. Windows are those of the callers, 0 for none.
class clsHtmlHelp {
public:
    clsHtmlHelp() = default;
    ~clsHtmlHelp();
    clsHtmlHelp(const clsHtmlHelp&) = delete;
    clsHtmlHelp& operator=(const clsHtmlHelp&) = delete;

    /// Sets the default help file.
    void SetFile(const std::string& vstrHelpFullPath) { defaultFile_ = vstrHelpFullPath; }
    void OpenTOC(const std::string& vstrHelpFullPath = {}, std::int32_t vlngCallerHWND = 0);
    /// A topic by its file name.
    void OpenTopic(const std::string& vstrTopicFileName, const std::string& vstrHelpFullPath = {},
                   std::int32_t vlngCallerHWND = 0);
    /// The id 0 shows the contents.
    void OpenContext(std::int32_t vlngHelpContextId, const std::string& vstrHelpFullPath = {},
                     std::int32_t vlngCallerHWND = 0);
    /// Closes the windows that were opened for a caller; those of all callers for 0.
    void CloseHelpWindows(std::int32_t vlngCallerHWND = 0);
    void CloseAll() { CloseHelpWindows(0); }
    void OpenIndex(const std::string& vstrHelpFullPath = {}, std::int32_t vlngCallerHWND = 0);
    void OpenSearch(const std::string& vstrHelpFullPath = {}, std::int32_t vlngCallerHWND = 0);

private:
    void Show(std::uint32_t command, const std::string& data, const std::string& path, std::int32_t caller);

    struct HelpWindow {
        std::int32_t caller = 0;
        std::int32_t window = 0;
    };

    std::string defaultFile_;
    std::vector<HelpWindow> windows_;
};

} // namespace tovimar
