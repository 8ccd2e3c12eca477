#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/ProjectSource.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/CAddInProject.h"
#include "foundation/Session.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "generation/RunProgress.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
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
        : arguments_(arguments), surroundings_(surroundings), source_(arguments, surroundings) {}

    int Run() {
        source_.Open();
        LoadProject();
        FindObject();
        return Take();
    }

private:
    void LoadProject();
    void FindObject();
    [[noreturn]] void RefuseObject(const CHelpPrjTreeNode* other) const;
    int Take();
    std::string Named() const { return Word(node_->ObjectType()) + " '" + node_->Name() + "'"; }

    const Arguments& arguments_;
    Surroundings& surroundings_;
    ProjectSource source_;
    Screenshot screenshot_;
    CTovimarActions actions_;
    const CHelpPrjTreeNode* node_ = nullptr;
};

void Retake::LoadProject() {
    // Whatever is wrong has been told by then.
    if (screenshot_.LoadProject(source_.ProjectFile()) != kSuccess || surroundings_.Boxes().errors > 0)
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
    throw Stop{"'" + source_.ProjectFile() + "' documents no " + wanted + " '" + arguments_.object + "'"};
}

int Retake::Take() {
    surroundings_.Progress().Phase("Taking pictures of the " + Named());
    const std::int32_t type = node_->ObjectType();
    auto& host = HostAgent();
    if (!host.ComponentExistsTest(type, node_->Name()))
        throw Stop{"the application '" + source_.Source() + "' has no " + Named()};
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
