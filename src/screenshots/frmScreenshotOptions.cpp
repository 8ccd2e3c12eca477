#include "screenshots/frmScreenshotOptions.h"

#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/Paths.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "screenshots/clsScreenshotOptions.h"

namespace tovimar {

namespace {

using Options = clsScreenshotOptions;

/// Each way a folder can be wrong; `what` is what it is for.
void CheckFolder(const std::string& folder, const std::string& what, std::vector<std::string>& complaints) {
    if (folder.empty())
        complaints.push_back("Undefined directory for " + what + ".");
    else if (!platform::Env().files->FolderExists(folder))
        complaints.push_back("Nonexistent directory for " + what + ".");
}

} // namespace

frmScreenshotOptions::frmScreenshotOptions(clsScreenshotOptions& options) : options_(options) {}

bool frmScreenshotOptions::TakesScreenshot() const {
    return options_.OpenMode == Options::kTakeScreenshot;
}

std::int32_t frmScreenshotOptions::PictureType() const {
    return optBitmap.chosen ? Options::kBitmap : Options::kJpeg;
}

void frmScreenshotOptions::ChoosePictureType(std::int32_t type) {
    optBitmap.chosen = type == Options::kBitmap;
    optJpeg.chosen = !optBitmap.chosen;
}

void frmScreenshotOptions::SetLoadTimeValues() {
    closed_ = false;
    cmdOK.caption = TakesScreenshot() ? "Take screenshot" : "OK";
    chkGenerateHTML.checked = options_.GenerateHTML;
    chkCaptureReportPreviewArea.checked = options_.CaptureReportPreviewArea;
    chkShowTakeScreenshotDlg.checked = options_.ShowTakeScreenShotDlg;
    chkShowScreenshotSucceededDlg.checked = options_.ShowScreenshotSucceededDlg;
    chkUserLocation.checked = options_.UserControlledScreenshotLocation;
    txtImagesFolder.text = options_.DirToSaveImages();
    const bool own = options_.ScreenshotOptionsDefined && options_.UserControlledScreenshotLocation;
    ChoosePictureType(own ? options_.PictureSaveType : options_.ActiveProjectImageType());
    txtImageFileName.text = own ? options_.CapturedImageFileName() : options_.DefaultImageFileName();
    FillHTMLFields();
    if (own && chkGenerateHTML.checked)
        txtHTMLFileName.text = options_.HTMLFileName();
    Enable();
}

void frmScreenshotOptions::FillHTMLFields() {
    const bool on = chkGenerateHTML.checked;
    const std::string folder =
        chkUserLocation.checked ? options_.DirToSaveHTML() : options_.HelpDirToSaveHTML();
    txtHTMLFolder.text = on ? folder : std::string();
    const std::string base = platform::BaseNameOf(txtImageFileName.text);
    txtHTMLFileName.text = on && !base.empty() ? base + ".htm" : std::string();
}

void frmScreenshotOptions::Enable() {
    const bool own = chkUserLocation.checked;
    const bool html = chkGenerateHTML.checked;
    txtImagesFolder.enabled = own;
    txtHTMLFolder.enabled = own && html;
    cmdBrowseImages.enabled = cmdBrowseImages.visible = own;
    cmdBrowseHTML.enabled = own && html;
    cmdBrowseHTML.visible = own;
    txtImagesFolder.widened = txtHTMLFolder.widened = !own;
    optBitmap.enabled = optJpeg.enabled = own;
    txtImageFileName.enabled = TakesScreenshot();
    txtHTMLFileName.enabled = TakesScreenshot() && html;
}

void frmScreenshotOptions::GenerateHTMLClick(bool checked) {
    chkGenerateHTML.checked = checked;
    FillHTMLFields();
    Enable();
}

void frmScreenshotOptions::UserLocationClick(bool checked) {
    chkUserLocation.checked = checked;
    if (!checked)
        ShowHelpLocation();
    Enable();
}

void frmScreenshotOptions::ShowHelpLocation() {
    txtImagesFolder.text = options_.HelpDirToSaveImages();
    ChoosePictureType(options_.ActiveProjectImageType());
    txtImageFileName.text = options_.DefaultImageFileName();
    FillHTMLFields();
}

void frmScreenshotOptions::ImageFileNameChange(const std::string& text) {
    txtImageFileName.text = text;
    if (!TakesScreenshot())
        return;
    const std::string base = platform::BaseNameOf(text);
    if (!base.empty())
        txtImageFileName.text = base + PictureExtension(PictureType());
    if (chkGenerateHTML.checked)
        txtHTMLFileName.text = base.empty() ? base : base + ".htm";
}

void frmScreenshotOptions::PictureTypeClick(std::int32_t type) {
    ChoosePictureType(type);
    ImageFileNameChange(txtImageFileName.text);
}

void frmScreenshotOptions::BrowseImagesClick() {
    Browse("Select folder for screenshot images", txtImagesFolder);
}

void frmScreenshotOptions::BrowseHTMLClick() {
    Browse("Select folder for generated HTML files", txtHTMLFolder);
}

void frmScreenshotOptions::Browse(const char* title, dialog::TextBox& field) {
    if (!BrowseForFolder)
        return;
    if (const std::string folder = BrowseForFolder(title, field.text); !folder.empty())
        field.text = folder;
}

std::vector<std::string> frmScreenshotOptions::Complaints(bool withFileNames) const {
    std::vector<std::string> complaints;
    const bool html = chkGenerateHTML.checked;
    CheckFolder(txtImagesFolder.text, "saved images", complaints);
    if (html)
        CheckFolder(txtHTMLFolder.text, "generated HTML", complaints);
    if (withFileNames && txtImageFileName.text.empty())
        complaints.emplace_back("Undefined filename for screenshot image.");
    if (withFileNames && html && txtHTMLFileName.text.empty())
        complaints.emplace_back("Undefined filename for generated HTML.");
    const auto ofHelp = [&](const dialog::TextBox& field) {
        return IsSameFolder(field.text, options_.HelpDirToSaveHTML()) ||
               IsSameFolder(field.text, options_.HelpDirToSaveImages());
    };
    if (chkUserLocation.checked && (ofHelp(txtImagesFolder) || ofHelp(txtHTMLFolder)))
        complaints.emplace_back("The folder for screenshot images \r\ncan't be the same as the folders \r\n"
                                "for generated HTML and/or images.");
    return complaints;
}

bool frmScreenshotOptions::Sound(bool withFileNames) const {
    const auto complaints = Complaints(withFileNames);
    if (!complaints.empty())
        ShowMessage(text::Join(complaints, "\r\n\r\n"), kMsgExclamation, kApplicationTitle, {}, 0,
                    "frmScreenshotOptions");
    return complaints.empty();
}

void frmScreenshotOptions::StoreValues() {
    options_.UserControlledScreenshotLocation = chkUserLocation.checked;
    options_.ShowTakeScreenShotDlg = chkShowTakeScreenshotDlg.checked;
    options_.GenerateHTML = chkGenerateHTML.checked;
    options_.CaptureReportPreviewArea = chkCaptureReportPreviewArea.checked;
    options_.ShowScreenshotSucceededDlg = chkShowScreenshotSucceededDlg.checked;
    options_.SetCapturedImageFileName(txtImageFileName.text);
    options_.SetHTMLFileName(txtHTMLFileName.text);
    options_.SetDirToSaveImages(txtImagesFolder.text);
    options_.SetDirToSaveHTML(txtHTMLFolder.text);
    options_.PictureSaveType = PictureType();
    if (auto* settings = Session::Settings())
        options_.Store(*settings);
}

void frmScreenshotOptions::OKClick() {
    if (!Sound(TakesScreenshot()))
        return;
    options_.ScreenshotOptionsDefined = true;
    StoreValues();
    options_.OKResult = true;
    closed_ = true;
}

void frmScreenshotOptions::CancelClick() {
    options_.OKResult = false;
    closed_ = true;
}

void frmScreenshotOptions::ApplyClick() {
    if (!Sound(/*withFileNames=*/false))
        return;
    StoreValues();
    if (auto* settings = Session::Settings())
        settings->Save(UserSettingsFile());
}

} // namespace tovimar
