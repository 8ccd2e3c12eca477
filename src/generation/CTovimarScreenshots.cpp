// The user's actions of the screenshot tool.

#include "foundation/BackupFileName.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "generation/HelpUtilities.h"
#include "generation/RunProgress.h"
#include "host/access/clsScreenShotToolbar.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/files/Paths.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "screenshots/clsScreenshotOptions.h"
#include "screenshots/frmScreenshotOK.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarActions";

/// Base name of the object's files in the project; empty for an object without them.
std::string FileNameInProject(std::int32_t type, const std::string& name) {
    const auto* tree = Session::HelpProjectTree();
    auto* root = tree == nullptr ? nullptr : tree->Root();
    const auto* node = root == nullptr ? nullptr : root->GetUIObjectXMLNode(type, name);
    return node == nullptr ? std::string() : platform::BaseNameOf(node->GeneratedHTMLFile());
}

} // namespace

clsScreenshotOptions& CTovimarActions::ScreenshotOptions() {
    if (screenshotOptions_ == nullptr) {
        screenshotOptions_ = std::make_unique<clsScreenshotOptions>();
        if (auto* settings = Session::Settings())
            screenshotOptions_->Load(*settings);
    }
    return *screenshotOptions_;
}

void CTovimarActions::GetScreenshotOptions() {
    Trapped(kClass, "GetScreenshotOptions", [&] {
        if (!RunData().IsMSAccessDbOpened())
            return;
        RunData().LoadSettings(/*vfSkipIfLoaded=*/true);
        ScreenshotOptions().GetOptions(clsScreenshotOptions::kOptionsOnly);
    });
}

bool CTovimarActions::TakeScreenshotAction() {
    bool taken = false;
    Trapped(kClass, "TakeScreenshotAction", [&] {
        if (!RunData().IsMSAccessDbOpened())
            return;
        RunData().LoadSettings(/*vfSkipIfLoaded=*/true);
        const std::string name = HostAgent().ActiveObjectName();
        const std::int32_t type = HostAgent().CurrentObjectType();
        if (name.empty()) {
            ShowMessage("There is no active object.\r\n"
                        "(Your form may have Popup property set to True, set it to False.)",
                        kMsgExclamation, kApplicationTitle);
            return;
        }
        auto& options = ScreenshotOptions();
        options.PictureSaveType = Session::Parameters()->ImagesFormat;
        options.SetDefaultFileNames(clsScreenshotOptions::kRunFormat, FileNameInProject(type, name));
        if (options.ShowTakeScreenShotDlg && !options.GetOptions(clsScreenshotOptions::kTakeScreenshot))
            return;
        taken = TakeScreenshot(type, name);
        HostAgent().ShowToolbar(clsScreenShotToolbar::kName);
    });
    return taken;
}

bool CTovimarActions::TakeScreenshot(std::int32_t type, const std::string& name) {
    bool taken = false;
    Trapped(kClass, "TakeScreenshot", [&] {
        const auto& options = ScreenshotOptions();
        if (!options.UserControlledScreenshotLocation && Session::CurrentProject() == nullptr) {
            WarningDialog("HTML Help project was not yet generated, compiled or opened in HTML Editor.");
            return;
        }
        const std::string picture =
            platform::Join(options.DirToSaveImages(), options.CapturedImageFileName());
        const std::string topic = options.GenerateHTML
                                      ? platform::Join(options.DirToSaveHTML(), options.HTMLFileName())
                                      : std::string();
        if (!topic.empty() && !BackUpFile(topic)) {
            WarningDialog("Cannot backup active object's HTML file.");
            return;
        }
        {
            const Hourglass hourglass;
            taken = HostAgent().TakeScreenshot(type, name, picture, topic);
        }
        if (!taken) {
            WarningDialog("Error detected while taking Screenshot.");
            return;
        }
        if (options.ShowScreenshotSucceededDlg && frmScreenshotOK::ShowDialog) {
            frmScreenshotOK dialog;
            dialog.SetURL(topic.empty() ? picture : topic);
            dialog.SetRecompileButtonVisible(!options.UserControlledScreenshotLocation);
            frmScreenshotOK::ShowDialog(dialog);
            if (dialog.OK())
                RecompileHelpProject();
        }
    });
    return taken;
}

} // namespace tovimar
