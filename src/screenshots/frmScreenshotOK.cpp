#include "screenshots/frmScreenshotOK.h"

#include "foundation/Product.h"
#include "foundation/ShowMessage.h"
#include "platform/Environment.h"

namespace tovimar {

std::function<void(frmScreenshotOK&)> frmScreenshotOK::ShowDialog;

void frmScreenshotOK::URLClick() const {
    if (!platform::Env().processes->Open(URL()))
        ShowMessage("Please open your browser to :\r\n" + URL(), kMsgExclamation, kApplicationTitle, {}, 0,
                    "frmScreenshotOK");
}

} // namespace tovimar
