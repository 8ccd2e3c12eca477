#pragma once

#include <cstdint>
#include <functional>
#include <string>

namespace tovimar {

class ISettings;
class frmScreenshotOptions;

/// What the user chose for retaken pictures. Folders and names that aren't the user's own are those of the
/// current help project and of the active object.
class clsScreenshotOptions {
public:
    /// `OpenMode`: the dialog only sets options, or takes a picture when it closes.
    static constexpr std::uint8_t kOptionsOnly = 0;
    static constexpr std::uint8_t kTakeScreenshot = 1;
    /// `PictureSaveType`.
    static constexpr std::int32_t kBitmap = 1;
    static constexpr std::int32_t kJpeg = 2;
    /// For `SetDefaultFileNames`: the run's format.
    static constexpr std::int32_t kRunFormat = -1;

    bool OKResult = false; ///< the dialog was closed by its OK button
    std::uint8_t OpenMode = kOptionsOnly;
    bool UserControlledScreenshotLocation = false;
    bool ShowTakeScreenShotDlg = false;
    bool ScreenshotOptionsDefined = false; ///< the user has confirmed the options once
    bool GenerateHTML = false;
    bool CaptureReportPreviewArea = false;
    bool ShowScreenshotSucceededDlg = true;
    std::int32_t PictureSaveType = kBitmap;

    /// Names with extension: the stored one, else that of the active object's files; empty with neither.
    std::string CapturedImageFileName() const;
    void SetCapturedImageFileName(const std::string& name) { capturedImageFileName_ = name; }
    std::string HTMLFileName() const;
    void SetHTMLFileName(const std::string& name) { htmlFileName_ = name; }

    /// The user's own place, else the help project's. One that is a folder of the help project itself gives
    /// a subfolder "Screenshots" of it, which is made.
    std::string DirToSaveImages() const;
    void SetDirToSaveImages(const std::string& folder) { dirToSaveImages_ = folder; }
    /// A user's own place takes pictures and topics alike.
    std::string DirToSaveHTML() const;
    void SetDirToSaveHTML(const std::string& folder) { dirToSaveHTML_ = folder; }

    /// Folders of the current project, else of the parameters.
    std::string HelpDirToSaveImages() const;
    std::string HelpDirToSaveHTML() const;

    /// Both names from `name`, or from the active object when it is empty; the picture's extension by the
    /// format.
    void SetDefaultFileNames(std::int32_t format, const std::string& name);
    /// Base name of the active object's files, fit for a file.
    std::string DefaultFileName() const;
    /// Name of the active object's picture in the current project; empty without an object.
    std::string DefaultImageFileName() const;
    /// What most pictures of the current project are; JPEG when there are as many of either.
    std::int32_t ActiveProjectImageType() const;

    /// Shows the dialog; True on OK. Without a way to show it the answer is False.
    bool GetOptions(std::uint8_t vbytOpenMode);
    /// Runs the dialog to its end. Set by a program with windows.
    static std::function<void(frmScreenshotOptions&)> ShowDialog;

    /// To and from options of the settings; absent ones keep their values. Format and preview area are the
    /// run's own parameters.
    void Load(ISettings& settings);
    void Store(ISettings& settings) const;

private:
    std::string capturedImageFileName_;
    std::string htmlFileName_;
    std::string dirToSaveImages_;
    std::string dirToSaveHTML_;
};

/// Extension of a picture with its dot: ".bmp" for 1, else ".jpg".
std::string PictureExtension(std::int32_t type);
/// The same folder, whatever the case and the backslash behind it. No folder is none.
bool IsSameFolder(const std::string& left, const std::string& right);

} // namespace tovimar
