#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "generation/RunProgress.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/access/AccessApplication.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "screenshots/Screenshot.h"
#include "screenshots/clsScreenshotOptions.h"

namespace tovimar::cli {
namespace {

/// "form" or "report", also "table", "query" and "macro".
std::string Word(std::int32_t objectType) {
    return text::ToLower(ObjectTypeText(objectType));
}

bool IsPictured(const CHelpPrjTreeNode& node) {
    return node.ObjectType() == ObjectType::kForm || node.ObjectType() == ObjectType::kReport;
}

/// Retakes one object's pictures: the steps in order, each stops the run by raising.
class Retake {
public:
    Retake(const Arguments& arguments, Surroundings& surroundings)
        : arguments_(arguments), surroundings_(surroundings) {}

    int Run() {
        FindProject();
        OpenSource();
        LoadProject();
        FindObject();
        return Take();
    }

private:
    void FindProject();
    void OpenSource();
    std::string RememberedSource() const;
    HostObject OpenRemembered(const std::string& path) const;
    void LoadProject();
    void FindObject();
    [[noreturn]] void RefuseObject(const CHelpPrjTreeNode* other) const;
    int Take();
    std::string Named() const { return Word(node_->ObjectType()) + " '" + node_->Name() + "'"; }
    std::string Native(const std::string& path) const { return platform::Env().files->ToNative(path); }

    const Arguments& arguments_;
    Surroundings& surroundings_;
    std::string projectFile_; ///< Windows path
    std::string source_;      ///< native
    CTovimarClient client_;
    Screenshot screenshot_;
    CTovimarActions actions_;
    const CHelpPrjTreeNode* node_ = nullptr;
};

void Retake::FindProject() {
    auto& files = *platform::Env().files;
    projectFile_ = files.FromNative(FullPath(arguments_.project));
    if (files.FolderExists(projectFile_)) {
        const auto found = files.ListFiles(projectFile_, "*.tvp");
        if (found.empty())
            throw Stop{"there is no help project (.tvp) in '" + projectFile_ + "'"};
        if (found.size() > 1)
            throw Stop{"'" + projectFile_ + "' holds several help projects: " + text::Join(found, ", ") +
                       "\nName one of these files."};
        projectFile_ = platform::Join(projectFile_, found.front());
    }
    XmlDocument file;
    if (!file.load(projectFile_))
        throw Stop{"'" + projectFile_ +
                   "' is no help project: " + text::TrimWhitespace(file.parseError().reason)};
    if (!file.selectSingleNode("//TovimarProject/Project"))
        throw Stop{"'" + projectFile_ + "' is no help project"};
}

/// The catalogue knows what each project was made from.
std::string Retake::RememberedSource() const {
    CAddInProjects catalogue;
    catalogue.Init(CataloguePath());
    const auto* project = catalogue.GetProjectDefinitionByTvpFullPath(projectFile_);
    if (project == nullptr || project->SourceProjectFullPath.empty())
        throw Stop{"it isn't known which application '" + projectFile_ +
                   "' was made from\n--source names its exports or its database."};
    return project->SourceProjectFullPath;
}

/// A folder of exports counts as a database of its name, which needn't be there; with one at hand the exports
/// beside it still belong to it.
HostObject Retake::OpenRemembered(const std::string& path) const {
    auto& files = *platform::Env().files;
    const std::string folder = platform::FolderOf(path);
    if (!files.FileExists(path) && !files.FolderExists(folder))
        throw Stop{"the application of the project isn't at '" + path +
                   "' any more\n--source names its place."};
    try {
        auto application = platform::access::OpenAccessApplication(files.ToNative(folder));
        const std::string name = application->Get("CurrentProject").AsObject()->Get("FullName").AsString();
        if (text::EqualsIgnoringCase(name, path))
            return application;
    } catch (const RaisedError&) {
        if (!files.FileExists(path))
            throw;
    }
    if (!files.FileExists(path))
        throw Stop{"the application of the project isn't at '" + path +
                   "' any more\n--source names its place."};
    return platform::access::OpenAccessApplication(files.ToNative(path));
}

void Retake::OpenSource() {
    HostObject application;
    if (arguments_.source.empty()) {
        const std::string remembered = RememberedSource();
        const bool named = platform::Env().files->FileExists(remembered);
        source_ =
            Native(named ? remembered : platform::WithoutTrailingBackslash(platform::FolderOf(remembered)));
        surroundings_.Progress().Phase("Reading " + source_);
        application = OpenRemembered(remembered);
    } else {
        source_ = arguments_.source;
        surroundings_.Progress().Phase("Reading " + source_);
        application = platform::access::OpenAccessApplication(source_);
    }
    StopIfInterrupted();
    RegisterSettingsLoader();
    if (client_.Connect(application) != kSuccess)
        throw Stop{"'" + source_ + "' can't be opened"};
    StopIfInterrupted();
}

void Retake::LoadProject() {
    // Whatever is wrong has been told by then.
    if (screenshot_.LoadProject(projectFile_) != kSuccess || surroundings_.Boxes().errors > 0)
        throw Stop{{}, kFailed};
    StopIfInterrupted();
}

void Retake::FindObject() {
    std::vector<CHelpPrjTreeNode*> nodes;
    Session::HelpProjectTree()->CollectObjectNodes(nodes);
    const CHelpPrjTreeNode* other = nullptr;
    for (const CHelpPrjTreeNode* node : nodes) {
        if (!text::EqualsIgnoringCase(node->Name(), arguments_.object))
            continue;
        using Kind = Arguments::ObjectKind;
        const Kind kind = node->ObjectType() == ObjectType::kReport ? Kind::Report : Kind::Form;
        if (!IsPictured(*node) || (arguments_.objectKind != Kind::Any && arguments_.objectKind != kind)) {
            other = node;
            continue;
        }
        if (node_ != nullptr)
            throw Stop{"there are a form and a report '" + node->Name() +
                       "'\n--form or --report says which one."};
        node_ = node;
    }
    if (node_ == nullptr)
        RefuseObject(other);
    if (node_->Skipped())
        throw Stop{"the " + Named() + " has no topic of its own in the help, and so no picture"};
    if (node_->ObjectType() == ObjectType::kReport && !Session::Parameters()->AddImageForReport)
        throw Stop{"the reports of this help have no pictures (AddImageForReport=false)"};
}

void Retake::RefuseObject(const CHelpPrjTreeNode* other) const {
    if (other != nullptr && !IsPictured(*other))
        throw Stop{"the " + Word(other->ObjectType()) + " '" + other->Name() + "' has no picture"};
    using Kind = Arguments::ObjectKind;
    const char* wanted = arguments_.objectKind == Kind::Form     ? "form"
                         : arguments_.objectKind == Kind::Report ? "report"
                                                                 : "form or report";
    throw Stop{"'" + projectFile_ + "' documents no " + wanted + " '" + arguments_.object + "'"};
}

int Retake::Take() {
    surroundings_.Progress().Phase("Taking pictures of the " + Named());
    const std::int32_t type = node_->ObjectType();
    auto& host = HostAgent();
    if (!host.ComponentExistsTest(type, node_->Name()))
        throw Stop{"the application '" + source_ + "' has no " + Named()};
    host.ActivateComponent(type, node_->Name(), /*forceOpenInDesignView=*/false, /*forceOpenAsHidden=*/false);
    auto& options = actions_.ScreenshotOptions();
    options.UserControlledScreenshotLocation = false;
    options.GenerateHTML = arguments_.topic;
    options.SetDefaultFileNames(clsScreenshotOptions::kRunFormat,
                                platform::BaseNameOf(node_->GeneratedHTMLFile()));
    const bool taken = surroundings_.Boxes().errors == 0 && actions_.TakeScreenshot(type, node_->Name());
    host.CloseComponent(type, node_->Name(), /*saveComponentFlag=*/false);
    surroundings_.Progress().Clear();
    StopIfInterrupted();
    if (!taken || surroundings_.Boxes().errors > 0 || Session::Run().runErrorCount != 0)
        return kFailed;
    ShowFile("Picture: ", platform::Join(options.DirToSaveImages(), options.CapturedImageFileName()));
    if (arguments_.topic)
        ShowFile("Topic:   ", platform::Join(options.DirToSaveHTML(), options.HTMLFileName()));
    if (platform::Env().files->FileExists(Session::CurrentProject()->CHMFullPath()))
        PrintHint("The compiled help holds the old pictures until it is compiled again.");
    return kDone;
}

} // namespace

int RetakeScreenshot(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Retake(arguments, surroundings).Run(); });
}

} // namespace tovimar::cli
