#pragma once

#include <cstdint>
#include <functional>
#include <string>

namespace tovimar {

/// Help button and F1 of one form, and the end of its help windows with it. A program's form calls the
/// events; this class knows of it what it needs and no window.
class clsHtmlHelpForForm {
public:
    struct Form {
        std::int32_t hwnd = 0;
        std::int32_t HelpContextID = 0;
        bool KeyPreview = false; ///< keys come to the form before its controls
    };

    /// The form stands until `Terminate`. An empty path is the system's own help.
    void Init(Form& rfrm, const std::string& vstrHelpFullPath = {});
    /// Once: closes the form's help windows and lets go of it.
    void Terminate();
    /// -1 takes the form's id.
    void OpenHelpEx(std::int32_t vlngHelpContextId);

    // Events of the form.
    void HelpClick();
    /// F1 opens the help and is consumed: the key becomes 0.
    void KeyDown(std::int32_t& KeyCode);
    /// Mode 0 is the user's closing the form; whoever closes it otherwise calls `Terminate`.
    void QueryUnload(std::int32_t mode);

    /// Called before help opens: the form's window, the help file, and by reference the id and whether to
    /// leave it.
    std::function<void(std::int32_t hwnd, const std::string& helpFile, std::int32_t& helpContextId,
                       bool& cancel)>
        BeforeOpen;

private:
    Form* form_ = nullptr;
    std::string path_;
    bool terminated_ = false;
};

} // namespace tovimar
