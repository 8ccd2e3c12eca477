#include "generation/clsHtmlHelp.h"

#include "platform/Environment.h"

namespace tovimar {

void clsHtmlHelp::OpenTOC(const std::string& vstrHelpFullPath, std::int32_t vlngCallerHWND) {
    constexpr std::uint32_t kDisplayContents = 1;
    platform::Env().helpViewer->Show(vlngCallerHWND, vstrHelpFullPath, kDisplayContents, {});
}

void clsHtmlHelp::CloseAll() {
    platform::Env().helpViewer->CloseAll();
}

} // namespace tovimar
