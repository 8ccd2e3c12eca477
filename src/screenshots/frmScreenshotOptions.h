#pragma once

#include "foundation/DialogControls.h"

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace tovimar {

class clsScreenshotOptions;

/// The dialog of the screenshot tool, without its window: it sets options, and before a shot it asks for
/// them. A window shows the controls, calls an operation for each thing that the user does and shows them
/// again. It closes when `Closed` says so.
class frmScreenshotOptions {
public:
    explicit frmScreenshotOptions(clsScreenshotOptions& options);

    const std::string Title = "Screenshot Options";
    dialog::CheckBox chkGenerateHTML{{"&Generate HTML files"}};
    dialog::CheckBox chkCaptureReportPreviewArea{{"&Reports: capture preview area only"}};
    dialog::CheckBox chkShowTakeScreenshotDlg{{"Show &take screenshot dialog"}};
    dialog::CheckBox chkShowScreenshotSucceededDlg{{"Show screenshot &succeeded dialog"}};
    dialog::CheckBox chkUserLocation{{"&User defined screenshot location"}};
    dialog::TextBox txtImagesFolder{{"Folder for screenshot &images"}};
    dialog::TextBox txtImageFileName{{"Captured image &filename"}};
    dialog::TextBox txtHTMLFolder{{"Folder for generated &HTML files"}};
    dialog::TextBox txtHTMLFileName{{"Generated HTML file&name"}};
    dialog::Button cmdBrowseImages{{"..."}};
    dialog::Button cmdBrowseHTML{{"..."}};
    dialog::OptionButton optBitmap{{"Bitma&p"}};
    dialog::OptionButton optJpeg{{"&Jpeg"}};
    dialog::Button cmdOK{{"OK"}};
    dialog::Button cmdCancel{{"Cancel"}};
    dialog::Button cmdApply{{"Apply"}};
    dialog::Button cmdHelp{{"Help"}};

    /// Everything from the options, as the dialog opens.
    void SetLoadTimeValues();

    void GenerateHTMLClick(bool checked);
    void UserLocationClick(bool checked);
    /// The picture's name decides the topic's; its extension follows the type.
    void ImageFileNameChange(const std::string& text);
    void PictureTypeClick(std::int32_t type);
    /// Asks for a folder; the field stays when none is chosen.
    void BrowseImagesClick();
    void BrowseHTMLClick();
    /// Title and folder shown at first; gives the chosen folder, empty for none.
    std::function<std::string(const std::string& title, const std::string& folder)> BrowseForFolder;

    /// Takes the values over and closes, unless a message told what is wrong with them.
    void OKClick();
    void CancelClick();
    /// Takes the values over and saves the settings; stays open.
    void ApplyClick();

    bool Closed() const { return closed_; }
    /// What is wrong with the values, one message each.
    std::vector<std::string> Complaints(bool withFileNames) const;

private:
    bool TakesScreenshot() const;
    std::int32_t PictureType() const;
    void ChoosePictureType(std::int32_t type);
    void ShowHelpLocation();
    void FillHTMLFields();
    void Enable();
    void Browse(const char* title, dialog::TextBox& field);
    bool Sound(bool withFileNames) const;
    void StoreValues();

    clsScreenshotOptions& options_;
    bool closed_ = false;
};

} // namespace tovimar
