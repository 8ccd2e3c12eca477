#pragma once

#include "foundation/DialogControls.h"

#include <functional>
#include <string>

namespace tovimar {

/// Tells where a picture went, without its window; see `frmScreenshotOptions` for how a window uses it.
class frmScreenshotOK {
public:
    const std::string Title = "Screenshot taken";
    dialog::Control lblStored{"Screenshot taken successfully and is stored in:"};
    dialog::Button lnkURL; ///< the path; a click opens it
    dialog::Button cmdRecompile{{"Recompile"}};
    dialog::Control lblRecompile{
        "To have the new image active in your HTML Help you have to recompile the Help "
        "Workshop Project."};
    dialog::Button cmdCancel{{"OK"}};

    const std::string& URL() const { return lnkURL.caption; }
    void SetURL(const std::string& path) { lnkURL.caption = path; }
    bool RecompileButtonVisible() const { return cmdRecompile.visible; }
    void SetRecompileButtonVisible(bool visible) { cmdRecompile.visible = lblRecompile.visible = visible; }
    /// "Recompile" was pressed.
    bool OK() const { return ok_; }
    bool Closed() const { return closed_; }

    /// Opens the path with the desktop's program; tells the user when there is none.
    void URLClick() const;
    void RecompileClick() { ok_ = closed_ = true; }
    void CancelClick() { closed_ = true; }

    /// Runs the dialog to its end. Set by a program with windows.
    static std::function<void(frmScreenshotOK&)> ShowDialog;

private:
    bool ok_ = false;
    bool closed_ = false;
};

} // namespace tovimar
