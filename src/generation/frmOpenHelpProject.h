#pragma once

#include "foundation/DialogControls.h"

#include <cstdint>
#include <functional>
#include <string>

namespace tovimar {

/// Asks which help project to open, without its window: a window shows the controls, calls an operation for
/// each thing that the user does and shows them again. It closes when `Closed` says so; a project that was
/// chosen is then the current one.
class frmOpenHelpProject {
public:
    /// Lists the projects of the source project at hand.
    frmOpenHelpProject();

    const std::string Title = "Open Tovimar Project";
    dialog::OptionButton optExisting{{"Existing Help Project"}, true};
    dialog::OptionButton optNewProject{{"New Help Project"}};
    /// Paths of project files, and last the entry "More Files...".
    dialog::ListBox lstProjectsList{{""}};
    dialog::Button cmdOK{{"OK"}};
    dialog::Button cmdCancel{{"Cancel"}};
    dialog::Button cmdHelp{{"Help"}};

    /// 1, before the form shows: no choice of a new project, the list fills the place of both options.
    void Preload(std::int32_t vintOpt);

    void ExistingClick();
    void NewProjectClick();
    void ListClick(std::int32_t entry) { lstProjectsList.selected = entry; }
    /// Selects the entry and acts as OK.
    void ListDblClick(std::int32_t entry);
    /// Makes the chosen project current and closes. Stays open when that fails, or when the user doesn't want
    /// a project with read-only files.
    void OKClick();
    void CancelClick() { closed_ = true; }
    /// What "More Files..." asks for: name and pattern of the file filter, flags of the platform's dialog.
    /// Gives a Windows path, empty for none; what follows a zero character is dropped.
    std::function<std::string(const std::string& filterName, const std::string& pattern, std::uint32_t flags)>
        ChooseFile;

    /// Of the chosen project's file; empty when none was chosen.
    const std::string& ProjectDefFullPath() const { return path_; }
    /// OK was pressed for a new project.
    bool NewProjectChosen() const { return newProject_; }
    bool Closed() const { return closed_; }

    /// Runs the dialog to its end. Set by a program with windows.
    static std::function<void(frmOpenHelpProject&)> ShowDialog;

private:
    std::string ChosenPath() const;
    bool Open(const std::string& path) const;

    std::string path_;
    bool newProject_ = false;
    bool closed_ = false;
};

} // namespace tovimar
