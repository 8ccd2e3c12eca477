#include "generation/frmOpenHelpProject.h"

#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CHelpPrjSelector.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"

#include <algorithm>

namespace tovimar {
namespace {

constexpr const char* kMoreFiles = "More Files...";
/// Of the file dialog of the platform, as its callers always passed them.
constexpr std::uint32_t kFileDialogFlags = 28715;

std::int64_t GetQtyOfReadOnlyFiles(const std::string& folder) {
    auto& files = *platform::Env().files;
    if (!files.FolderExists(folder))
        return 0;
    const auto names = files.ListFiles(folder, "*.*");
    return std::count_if(names.begin(), names.end(),
                         [&](const std::string& name) { return files.IsReadOnly(folder + name); });
}

bool HasReadOnlyFiles(CAddInProject& project) {
    return GetQtyOfReadOnlyFiles(platform::WithTrailingBackslash(project.Folder)) > 0 ||
           GetQtyOfReadOnlyFiles(project.XmlFormsFolder()) > 0 ||
           GetQtyOfReadOnlyFiles(project.PicsSubfolderPath()) > 0;
}

bool WantsReadOnlyProject(const CAddInProject& project) {
    const std::string question =
        "Some of the files of selected Tovimar project \r\n\r\n" + project.TvpFullPath() +
        "\r\n\r\nare read-only. Editing and saving of these files could result in errors.\r\n"
        "As a result of these errors you can loose your edits.\r\n\r\n"
        "Would you like to continue opening selected Tovimar project anyway ?";
    return ShowMessage(question, kMsgYesNo | kMsgExclamation, kApplicationTitle, {}, 0,
                       "frmOpenHelpProject.cmdOK_Click") == platform::kAnswerYes;
}

} // namespace

std::function<void(frmOpenHelpProject&)> frmOpenHelpProject::ShowDialog;

frmOpenHelpProject::frmOpenHelpProject() {
    CHelpPrjSelector selector;
    selector.Init();
    lstProjectsList.entries = selector.ExistingProjects();
    lstProjectsList.entries.emplace_back(kMoreFiles);
    selector.Terminate();
}

void frmOpenHelpProject::Preload(std::int32_t vintOpt) {
    if (vintOpt != 1)
        return;
    optExisting.visible = optNewProject.visible = false;
    lstProjectsList.widened = true;
}

void frmOpenHelpProject::ExistingClick() {
    optExisting.chosen = true;
    optNewProject.chosen = false;
    lstProjectsList.enabled = true;
}

void frmOpenHelpProject::NewProjectClick() {
    optExisting.chosen = false;
    optNewProject.chosen = true;
    lstProjectsList.enabled = false;
    lstProjectsList.selected = -1;
}

void frmOpenHelpProject::ListDblClick(std::int32_t entry) {
    ListClick(entry);
    OKClick();
}

/// The selected project's file, or the one that the user looks up; empty for none.
std::string frmOpenHelpProject::ChosenPath() const {
    const std::string entry = lstProjectsList.SelectedEntry();
    if (entry != kMoreFiles)
        return entry;
    std::string file = ChooseFile ? ChooseFile("Tovimar Project (TVP)", "*.tvp", kFileDialogFlags) : "";
    platform::Env().doEvents();
    file.erase(std::min(file.find('\0'), file.size()));
    return file;
}

/// Makes the project current; false when that failed or the user thinks better of it.
bool frmOpenHelpProject::Open(const std::string& path) const {
    CHelpPrjSelector selector;
    if (selector.SetCurrent(path, /*vfLoadingExternalProject=*/true) != kSuccess)
        return false;
    auto& project = *Session::CurrentProject();
    return !HasReadOnlyFiles(project) || WantsReadOnlyProject(project);
}

void frmOpenHelpProject::OKClick() {
    Trapped("frmOpenHelpProject", "cmdOK_Click", [&] {
        const std::string path = optExisting.chosen ? ChosenPath() : std::string();
        if (!path.empty() && !Open(path))
            return;
        path_ = path;
        newProject_ = optNewProject.chosen;
        closed_ = true;
    });
}

} // namespace tovimar
