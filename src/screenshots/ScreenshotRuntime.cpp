// Shots for a running application: the help project is loaded here, a form's files are found by its name.

#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/RunProgress.h"
#include "host/access/LateBound.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "screenshots/ScreenshotRecord.h"
#include "uimodel/CXmlForm.h"

#include <algorithm>
#include <cstdint>

namespace tovimar {

namespace {

constexpr std::int32_t kBitmap = 1;
constexpr std::int32_t kJpeg = 2;
/// The files are those of the loaded project.
constexpr std::int32_t kOfProject = -1;
constexpr ResultCode kNoProject = MakeResultCode(0x80040005U);
constexpr ResultCode kUnknownForm = MakeResultCode(0x80040006U);
constexpr const char* kNameTag = "{{FormName}}";
constexpr const char* kFormatOption = "SnapshotFormat";

void RaiseIfFailed(ResultCode code) {
    if (code != kSuccess)
        throw RaisedError(code, "Error " + std::to_string(code), "Screenshot.LoadProject");
}

} // namespace

/// Where a shot's files go.
struct Screenshot::Place {
    std::int32_t picType = 0;
    std::string folder;
    std::string picture;
    std::string topic;
    std::string picsFolder;

    void NameForm(const std::string& formName) {
        for (std::string* name : {&picture, &topic})
            *name = text::ReplaceAllIgnoringCase(*name, kNameTag, formName);
    }
    bool NeedsName() const {
        return picType == kOfProject || text::ContainsIgnoringCase(picture + "\n" + topic, kNameTag);
    }
};

/// What is taken: an object of the application, or only a window of it.
struct Screenshot::Target {
    HostObject object;
    std::int32_t window = 0;
    std::string name;

    bool IsVSNet() const { return object == nullptr; }
    std::int32_t Type() const {
        const std::string type = object == nullptr ? "Form" : late::ClassName(object);
        return text::StartsWithIgnoringCase(type, "Form") ? ObjectType::kForm : ObjectType::kReport;
    }
};

void Screenshot::EnsureServer() {
    if (Session::ServerData() == nullptr) {
        TheServer().Connect();
        ownServer_ = true;
    }
    RunData().LoadSettings();
}

ResultCode Screenshot::LoadProject(const std::string& tvpFileFullPath) {
    if (!loadedProject_.empty() && text::EqualsIgnoringCase(loadedProject_, tvpFileFullPath))
        return Fail(kSuccess, {});
    std::string unread;
    const auto failed = Guarded("LoadProject", [&] {
        ReadProject(tvpFileFullPath);
        unread = lastErrDscr_;
    });
    if (failed == kSuccess)
        lastErrDscr_ = unread;
    return failed;
}

void Screenshot::ReadProject(const std::string& path) {
    EnsureServer();
    auto& catalogue = *Session::Projects();
    if (const auto code = catalogue.Init(CataloguePath()); code != kSuccess)
        throw RaisedError(kFailure1,
                          "Error loading project definitions of '" + path +
                              "', ErrCode = " + std::to_string(code),
                          "Screenshot.LoadProject");
    RaiseIfFailed(RunData().ReLoadSettings(path, /*vfLoadSettingsFromTvpFile=*/true));
    auto& generator = RunData().Generator();
    generator.UnLoadTreviewForActiveProject();
    auto& tree = generator.HelpProjectTree();
    tree.Reset();
    RaiseIfFailed(tree.Load(path));
    CAddInProject& project = ProjectOf(catalogue, path);
    catalogue.SetCurrentProject(&project);
    generator.Parameters().SetFolderForGeneratedHelp(project.Folder);
    generator.Parameters().SetNameOfFolderForGeneratedImages(project.PicsSubfolderName);

    records_.clear();
    loadedProjectSnapshotFormat_ = Session::Settings()->OptionValue(kFormatOption).AsString();
    std::vector<CHelpPrjTreeNode*> nodes;
    tree.CollectObjectNodes(nodes);
    for (CHelpPrjTreeNode* node : nodes)
        ReadRecord(*node, project);
    loadedProjectHtmlFolder_ = project.Folder;
    loadedProjectPicsFolder_ = project.PicsSubfolderPath();
    loadedProject_ = path;
}

CAddInProject& Screenshot::ProjectOf(CAddInProjects& catalogue, const std::string& path) {
    if (auto* known = catalogue.GetProjectDefinitionByTvpFullPath(path))
        return *known;
    const auto* root = Session::HelpProjectTree()->Root();
    if (root == nullptr)
        throw RaisedError(kFailure1, "There is no project in '" + path + "'", "Screenshot.LoadProject");
    auto project = std::make_unique<CAddInProject>();
    project->Name = root->Name();
    project->SetTitle(root->HtmlTitle());
    project->FileName = platform::BaseNameOf(path);
    project->Folder = platform::FolderOf(path);
    project->PicsSubfolderName = root->PicsSubfolderName();
    return catalogue.Add(std::move(project));
}

void Screenshot::ReadRecord(CHelpPrjTreeNode& node, CAddInProject& project) {
    const std::string file = node.XmlFormFileName();
    const std::string path = platform::Join(project.XmlFormsFolder(), file);
    if (file.empty() || !platform::Env().files->FileExists(path))
        return;
    CXmlForm form;
    if (const auto code = form.Load(path, &project); code != kSuccess) {
        lastErrDscr_ = "Error " + std::to_string(code);
        return;
    }
    records_.push_back({form.Name, loadedProjectSnapshotFormat_, form.HtmlFullPath(), form.PicFullPath()});
}

ResultCode Screenshot::CheckPlace(std::int32_t picType, const std::string& targetFolder,
                                  const std::string& picFileNameExt) {
    if (picType != kBitmap && picType != kJpeg)
        return Fail(kFailure1, "Pictype can be only equal to 1(Bitmap) or 2(Jpeg)");
    if (targetFolder.empty())
        return Fail(kFailure2, "TargetFolder isn't specified");
    if (picFileNameExt.empty())
        return Fail(kFailure3, "Picture file name isn't specified");
    return Fail(kSuccess, {});
}

ResultCode Screenshot::FindPlace(const std::string& formName, Place& place) {
    if (loadedProject_.empty())
        return Fail(kNoProject, "Source Tovimar project isn't loaded.");
    const auto record = std::find_if(records_.begin(), records_.end(), [&](const FormRecord& one) {
        return text::EqualsIgnoringCase(one.Name, formName);
    });
    if (record == records_.end())
        return Fail(kUnknownForm,
                    "Form [" + formName + "] not found in generated project '" + loadedProject_ + "'");
    place.picType = text::EqualsIgnoringCase(record->SnapshotFormat, "Bitmap") ? kBitmap : kJpeg;
    place.folder = platform::FolderOf(record->picFullPath);
    place.picture = platform::FileNameOf(record->picFullPath);
    // The topic lies in the project's folder, the pictures in one below it.
    place.topic = record->htmlFullPath;
    place.picsFolder = loadedProjectPicsFolder_;
    return Fail(kSuccess, {});
}

ResultCode Screenshot::TakeVB6FormScreenshot(const HostObject& frm, std::int32_t picType,
                                             const std::string& targetFolder,
                                             const std::string& picFileNameExt,
                                             const std::string& htmlFileNameExt,
                                             const std::string& picsFolder, bool GenerateHTML) {
    Target target{frm, 0, {}};
    if (const auto failed = Guarded("TakeVB6FormScreenshot", [&] { target.name = late::Text(frm, "Name"); });
        failed != kSuccess)
        return failed;
    return TakeAtRuntime(target, {picType, targetFolder, picFileNameExt, htmlFileNameExt, picsFolder},
                         GenerateHTML);
}

ResultCode Screenshot::TakeWinFormScreenshot(std::int32_t vlngHwnd, std::int32_t picType,
                                             const std::string& targetFolder,
                                             const std::string& picFileNameExt,
                                             const std::string& htmlFileNameExt,
                                             const std::string& picsFolder, bool GenerateHTML) {
    Target target{nullptr, vlngHwnd, {}};
    const Place place{picType, targetFolder, picFileNameExt, htmlFileNameExt, picsFolder};
    if (place.NeedsName()) {
        const auto failed = Guarded("TakeWinFormScreenshot", [&] {
            target.name = HostAgent().GetWinFormNameByHWND(vlngHwnd);
            if (target.name.empty())
                throw RaisedError(kUnknownForm,
                                  "Form not found for HWND = " + std::to_string(vlngHwnd) + " and project '" +
                                      loadedProject_ + "'",
                                  "Screenshot.TakeWinFormScreenshot");
        });
        if (failed != kSuccess)
            return failed;
    }
    return TakeAtRuntime(target, place, GenerateHTML);
}

ResultCode Screenshot::TakeAtRuntime(const Target& target, Place place, bool generateHtml) {
    const bool ofProject = place.picType == kOfProject;
    const auto found =
        ofProject ? FindPlace(target.name, place) : CheckPlace(place.picType, place.folder, place.picture);
    if (found != kSuccess)
        return found;
    place.NameForm(target.name);
    if (!generateHtml)
        place.topic.clear();
    else if (!ofProject && !place.topic.empty())
        place.topic = platform::Join(place.folder, place.topic);
    if (place.picsFolder.empty())
        place.picsFolder = place.folder;
    ResultCode taken = kSuccess;
    const auto failed = Guarded("TakeScreenshot", [&] {
        CTovimarClient client;
        const bool connects = !TheServer().TovimarClientCallBack;
        if (connects) {
            const HostObject application = late::ObjectOrNull(target.object, "Application");
            if (const auto code = client.Connect(application ? application : target.object); code != kSuccess)
                throw RaisedError(code, "There is no connection to a host.", "Screenshot");
        }
        taken = TakeOfConnection(target, place);
        if (connects)
            client.Disconnect();
    });
    return failed != kSuccess ? failed : taken;
}

ResultCode Screenshot::TakeOfConnection(const Target& target, const Place& place) {
    RunData().Runtime = true;
    RunData().LoadSettings();
    Session::Parameters()->ImagesFormat = place.picType;
    const std::string name = target.name.empty() ? std::to_string(target.window) : target.name;
    takenImageFullPath_ = platform::Join(place.folder, place.picture);
    if (target.IsVSNet())
        return TakeScreenshot(target.Type(), name, takenImageFullPath_, place.topic, /*vfIsVSNet=*/true,
                              place.picsFolder);
    return HostAgent().TakeScreenshot(target.Type(), name, takenImageFullPath_, place.topic)
               ? Fail(kSuccess, {})
               : Fail(kGeneralFailure, "The host took no picture of [" + name + "].");
}

} // namespace tovimar
