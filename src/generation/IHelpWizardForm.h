#pragma once

namespace tovimar {

/// What the actions ask of the wizard. It runs without blocking: when it is closed, by Finish or by Cancel,
/// it calls `CTovimarServer::ProcessWizardFormClosing`.
class IHelpWizardForm {
public:
    virtual ~IHelpWizardForm() = default;

    /// Loads the pages and shows the first one.
    virtual void Init() = 0;
    virtual void Show() = 0;
    virtual void Hide() = 0;
    virtual bool Visible() const = 0;
    /// It was closed by Finish, so its options count.
    virtual bool OK() const = 0;
    /// A second call does nothing.
    virtual void Terminate() = 0;
};

} // namespace tovimar
