#pragma once

namespace tovimar {

/// What the server asks of the help editor. While it stands it is in the list of loaded forms as
/// "frmHelpEditor"; its end unloads it.
class IHelpEditorForm {
public:
    virtual ~IHelpEditorForm() = default;

    virtual void Init() = 0;
    /// Opens the start page of the current tree.
    virtual void OpenRootDocument() = 0;
    virtual void Display() = 0;
    virtual void SetFocusToHTMLEditor() = 0;
};

} // namespace tovimar
