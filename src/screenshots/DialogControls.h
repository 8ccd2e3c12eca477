#pragma once

#include <string>

/// What a window shows of a dialog: values go in and out, the dialog sets the rest.
namespace tovimar::dialog {

struct Control {
    std::string caption; ///< with its accelerator mark
    bool enabled = true;
    bool visible = true;
};

struct CheckBox : Control {
    bool checked = false;
};

/// One of a group, of which one is chosen.
struct OptionButton : Control {
    bool chosen = false;
};

/// `caption` is that of its label.
struct TextBox : Control {
    std::string text = {};
    bool widened = false; ///< takes the space of the hidden button beside it
};

struct Button : Control {};

} // namespace tovimar::dialog
