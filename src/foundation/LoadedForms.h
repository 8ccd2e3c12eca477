#pragma once

#include <string>
#include <vector>

namespace tovimar {

/// A form while it is loaded: it stands in the session's list under its name, "frmHelpEditor" say, from its
/// making to its end.
class LoadedForm {
public:
    explicit LoadedForm(std::string name);
    virtual ~LoadedForm();
    LoadedForm(const LoadedForm&) = delete;
    LoadedForm& operator=(const LoadedForm&) = delete;

    const std::string& FormName() const { return name_; }
    virtual void SetVisible(bool visible) = 0;
    virtual void SetFocus() = 0;

private:
    std::string name_;
};

/// The loaded forms of the process, in the order of their loading; none is owned.
class LoadedForms {
public:
    /// Without regard to case; null when no such form is loaded.
    LoadedForm* Find(const std::string& name) const;

private:
    friend class LoadedForm;

    std::vector<LoadedForm*> forms_;
};

} // namespace tovimar
