#include "generation/clsHtmlHelpForForm.h"

#include "foundation/Paths.h"
#include "generation/RunProgress.h"
#include "generation/clsHtmlHelp.h"
#include "host/server/CTovimarServerData.h"

namespace tovimar {

void clsHtmlHelpForForm::Init(Form& rfrm, const std::string& vstrHelpFullPath) {
    form_ = &rfrm;
    form_->KeyPreview = true;
    path_ = vstrHelpFullPath.empty() ? OwnHelpFile() : vstrHelpFullPath;
}

void clsHtmlHelpForForm::Terminate() {
    if (terminated_ || form_ == nullptr)
        return;
    terminated_ = true;
    RunData().HtmlHelp().CloseHelpWindows(form_->hwnd);
    form_ = nullptr;
}

void clsHtmlHelpForForm::OpenHelpEx(std::int32_t vlngHelpContextId) {
    if (form_ == nullptr)
        return;
    const std::int32_t id = vlngHelpContextId == -1 ? form_->HelpContextID : vlngHelpContextId;
    RunData().HtmlHelp().OpenContext(id, path_, form_->hwnd);
}

void clsHtmlHelpForForm::HelpClick() {
    if (form_ == nullptr)
        return;
    std::int32_t id = form_->HelpContextID;
    bool cancel = false;
    if (BeforeOpen)
        BeforeOpen(form_->hwnd, path_, id, cancel);
    if (!cancel && form_ != nullptr)
        RunData().HtmlHelp().OpenContext(id, path_, form_->hwnd);
}

void clsHtmlHelpForForm::KeyDown(std::int32_t& KeyCode) {
    constexpr std::int32_t kF1 = 112;
    if (KeyCode != kF1)
        return;
    KeyCode = 0;
    HelpClick();
}

void clsHtmlHelpForForm::QueryUnload(std::int32_t mode) {
    constexpr std::int32_t kClosedByUser = 0;
    if (mode == kClosedByUser)
        Terminate();
}

} // namespace tovimar
