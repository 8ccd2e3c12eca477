#include "screenshots/clsScreenshotOptions.h"

#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/ISettings.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ComponentFileName.h"
#include "screenshots/frmScreenshotOptions.h"

#include <array>
#include <utility>

namespace tovimar {

namespace {

constexpr const char* kClass = "clsScreenshotOptions";
constexpr const char* kOwnFolder = "Screenshots";
/// Stands for an object that the project doesn't know.
constexpr const char* kUnknownObject = "~!tempName";

using Options = clsScreenshotOptions;
constexpr std::array<std::pair<const char*, bool Options::*>, 5> kFlags{
    {{"UserControlledScreenshotLocation", &Options::UserControlledScreenshotLocation},
     {"ShowTakeScreenShotDlg", &Options::ShowTakeScreenShotDlg},
     {"ScreenshotOptionsDefined", &Options::ScreenshotOptionsDefined},
     {"GenerateHTML", &Options::GenerateHTML},
     {"ShowScreenshotSucceededDlg", &Options::ShowScreenshotSucceededDlg}}};

std::string ActiveObjectName() {
    auto* agent = Session::ServerAgent();
    return agent == nullptr ? std::string() : agent->ActiveObjectName();
}

const CHelpPrjTreeNode* NodeOfActiveObject() {
    const auto* tree = Session::HelpProjectTree();
    auto* agent = Session::ServerAgent();
    if (tree == nullptr || tree->Root() == nullptr || agent == nullptr)
        return nullptr;
    return tree->Root()->GetUIObjectXMLNode(agent->CurrentObjectType(), agent->ActiveObjectName());
}

/// The last folder's name: what stands behind the last backslash, slash or colon.
bool EndsInFolder(const std::string& path, const char* name) {
    const std::string folder = platform::WithoutTrailingBackslash(path);
    const auto delimiter = folder.find_last_of("\\/:");
    return delimiter != std::string::npos && text::EqualsIgnoringCase(folder.substr(delimiter + 1), name);
}

} // namespace

std::function<void(frmScreenshotOptions&)> clsScreenshotOptions::ShowDialog;

std::string PictureExtension(std::int32_t type) {
    return type == clsScreenshotOptions::kBitmap ? ".bmp" : ".jpg";
}

bool IsSameFolder(const std::string& left, const std::string& right) {
    return !left.empty() && text::EqualsIgnoringCase(platform::WithTrailingBackslash(left),
                                                     platform::WithTrailingBackslash(right));
}

std::string clsScreenshotOptions::HelpDirToSaveImages() const {
    auto* project = Session::CurrentProject();
    const std::string folder = project == nullptr ? std::string() : project->PicsSubfolderPath();
    const auto* parameters = Session::Parameters();
    return folder.empty() && parameters != nullptr ? parameters->FolderForGeneratedImages() : folder;
}

std::string clsScreenshotOptions::HelpDirToSaveHTML() const {
    if (const auto* project = Session::CurrentProject())
        return project->Folder;
    const auto* parameters = Session::Parameters();
    return parameters == nullptr ? std::string() : parameters->FolderForGeneratedHelp();
}

std::string clsScreenshotOptions::DirToSaveImages() const {
    if (!UserControlledScreenshotLocation || dirToSaveImages_.empty())
        return HelpDirToSaveImages();
    std::string folder = dirToSaveImages_;
    const bool ofHelp =
        IsSameFolder(folder, HelpDirToSaveHTML()) || IsSameFolder(folder, HelpDirToSaveImages());
    if (ofHelp && !EndsInFolder(folder, "images") && !EndsInFolder(folder, kOwnFolder))
        folder = platform::Join(folder, kOwnFolder);
    Trapped(kClass, "DirToSaveImages", [&] { platform::Env().files->MakeFolders(folder); });
    return folder;
}

std::string clsScreenshotOptions::DirToSaveHTML() const {
    const bool own = UserControlledScreenshotLocation && !dirToSaveHTML_.empty() && !dirToSaveImages_.empty();
    return own ? DirToSaveImages() : HelpDirToSaveHTML();
}

std::string clsScreenshotOptions::DefaultFileName() const {
    const auto* node = NodeOfActiveObject();
    return GetComponentFileName(node == nullptr ? kUnknownObject
                                                : platform::BaseNameOf(node->GeneratedHTMLFile()));
}

std::string clsScreenshotOptions::DefaultImageFileName() const {
    return ActiveObjectName().empty() ? std::string()
                                      : DefaultFileName() + PictureExtension(ActiveProjectImageType());
}

std::string clsScreenshotOptions::CapturedImageFileName() const {
    return capturedImageFileName_.empty() ? DefaultImageFileName() : capturedImageFileName_;
}

std::string clsScreenshotOptions::HTMLFileName() const {
    return htmlFileName_.empty() && !ActiveObjectName().empty() ? DefaultFileName() + ".htm" : htmlFileName_;
}

void clsScreenshotOptions::SetDefaultFileNames(std::int32_t format, const std::string& name) {
    const auto* parameters = Session::Parameters();
    if (format == kRunFormat && parameters != nullptr)
        format = parameters->ImagesFormat;
    const std::string base = name.empty() ? DefaultFileName() : name;
    capturedImageFileName_ = base + PictureExtension(format);
    htmlFileName_ = base + ".htm";
}

std::int32_t clsScreenshotOptions::ActiveProjectImageType() const {
    auto* project = Session::CurrentProject();
    if (project == nullptr)
        return kBitmap;
    std::int32_t type = kJpeg;
    Trapped(kClass, "ActiveProjectImageType", [&] {
        auto& files = *platform::Env().files;
        const std::string folder = project->PicsSubfolderPath();
        if (!files.FolderExists(folder))
            return;
        if (files.ListFiles(folder, "*.bmp").size() > files.ListFiles(folder, "*.jpg").size())
            type = kBitmap;
    });
    return type;
}

bool clsScreenshotOptions::GetOptions(std::uint8_t vbytOpenMode) {
    OpenMode = vbytOpenMode;
    OKResult = false;
    Trapped(kClass, "GetOptions", [&] {
        frmScreenshotOptions dialog(*this);
        dialog.SetLoadTimeValues();
        if (ShowDialog)
            ShowDialog(dialog);
    });
    return OKResult;
}

void clsScreenshotOptions::Load(ISettings& settings) {
    for (const auto& [name, flag] : kFlags)
        if (const Value value = settings.OptionValue(name); value.IsBoolean())
            this->*flag = value.AsBoolean();
    dirToSaveImages_ = settings.OptionValue("DirToSaveImages").AsString();
    dirToSaveHTML_ = settings.OptionValue("DirToSaveHTML").AsString();
    if (const auto* parameters = Session::Parameters()) {
        CaptureReportPreviewArea = parameters->CapturePreviewAreaOnly;
        PictureSaveType = parameters->ImagesFormat == kBitmap ? kBitmap : kJpeg;
    }
}

void clsScreenshotOptions::Store(ISettings& settings) const {
    for (const auto& [name, flag] : kFlags)
        settings.SetOptionValue(name, Value(this->*flag));
    settings.SetOptionValue("DirToSaveImages", Value(dirToSaveImages_));
    settings.SetOptionValue("DirToSaveHTML", Value(dirToSaveHTML_));
    if (auto* parameters = Session::Parameters()) {
        parameters->CapturePreviewAreaOnly = CaptureReportPreviewArea;
        parameters->ImagesFormat = PictureSaveType;
    }
}

} // namespace tovimar
