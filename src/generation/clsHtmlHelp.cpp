#include "generation/clsHtmlHelp.h"

#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"

namespace tovimar {
namespace {

/// Commands of the help viewer.
constexpr std::uint32_t kDisplayTopic = 0;
constexpr std::uint32_t kDisplayContents = 1;
constexpr std::uint32_t kDisplayIndex = 2;
constexpr std::uint32_t kDisplaySearch = 3;
constexpr std::uint32_t kHelpContext = 15;

} // namespace

clsHtmlHelp::~clsHtmlHelp() {
    PassOver([this] { CloseAll(); });
}

void clsHtmlHelp::OpenTOC(const std::string& vstrHelpFullPath, std::int32_t vlngCallerHWND) {
    Show(kDisplayContents, {}, vstrHelpFullPath, vlngCallerHWND);
}

void clsHtmlHelp::OpenTopic(const std::string& vstrTopicFileName, const std::string& vstrHelpFullPath,
                            std::int32_t vlngCallerHWND) {
    Show(kDisplayTopic, vstrTopicFileName, vstrHelpFullPath, vlngCallerHWND);
}

void clsHtmlHelp::OpenContext(std::int32_t vlngHelpContextId, const std::string& vstrHelpFullPath,
                              std::int32_t vlngCallerHWND) {
    if (vlngHelpContextId == 0)
        OpenTOC(vstrHelpFullPath, vlngCallerHWND);
    else
        Show(kHelpContext, std::to_string(vlngHelpContextId), vstrHelpFullPath, vlngCallerHWND);
}

void clsHtmlHelp::OpenIndex(const std::string& vstrHelpFullPath, std::int32_t vlngCallerHWND) {
    Show(kDisplayIndex, {}, vstrHelpFullPath, vlngCallerHWND);
}

void clsHtmlHelp::OpenSearch(const std::string& vstrHelpFullPath, std::int32_t vlngCallerHWND) {
    Show(kDisplaySearch, {}, vstrHelpFullPath, vlngCallerHWND);
}

void clsHtmlHelp::Show(std::uint32_t command, const std::string& data, const std::string& path,
                       std::int32_t caller) {
    auto& viewer = *platform::Env().helpViewer;
    const std::int32_t window = viewer.Show(caller, path.empty() ? defaultFile_ : path, command, data);
    if (window < 1)
        return;
    viewer.MakeTopmost(window);
    windows_.push_back({caller, window});
}

void clsHtmlHelp::CloseHelpWindows(std::int32_t vlngCallerHWND) {
    auto& environment = platform::Env();
    for (std::size_t i = windows_.size(); i-- > 0;) {
        // Closing lets messages run, which may have closed others.
        if (i >= windows_.size() || (vlngCallerHWND != 0 && windows_[i].caller != vlngCallerHWND))
            continue;
        const std::int32_t window = windows_[i].window;
        windows_.erase(windows_.begin() + static_cast<std::ptrdiff_t>(i));
        if (!environment.helpViewer->IsOpen(window))
            continue;
        environment.helpViewer->Close(window);
        // The viewer drops this window before the next one is closed.
        environment.doEvents();
    }
}

} // namespace tovimar
