#pragma once

#include <cstdint>
#include <string>
#include <vector>

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

/// A list with at most one selected entry.
struct ListBox : Control {
    std::vector<std::string> entries = {};
    std::int32_t selected = -1; ///< from 0; -1 is none
    bool widened = false;       ///< takes the space of hidden controls above it

    std::string SelectedEntry() const {
        const bool any = selected >= 0 && static_cast<std::size_t>(selected) < entries.size();
        return any ? entries[static_cast<std::size_t>(selected)] : std::string();
    }
};

struct Button : Control {};

} // namespace tovimar::dialog
