#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <utility>

namespace tovimar {

/// Everything a run is told: who wrote the application, where the help goes, which kinds of object are
/// documented and with which parts of a topic. Filled by the settings loader, read everywhere. Properties
/// without a rule are plain members; options keep the same names unless noted.
class CTovimarParameters {
public:
    bool CompileHTMLHelp = false;
    bool SaveApplicationChanges = false; ///< help file and context ids are kept in the source project
    bool OpenHTMLEditor = false;
    bool OpenHTMLHelp = false;
    std::string LastUsedFolderForCapturedImages;
    std::string LastUsedFolderForGeneratedHelp;
    bool CapturePreviewAreaOnly = false; ///< reports without the frame of the preview window
    bool MakeNormalViewScreenshots =
        false; ///< objects open in normal view for the capture, else in design view
    bool SkipInvisibleControls = false;
    bool InsertExternalDescriptions = false;
    std::string LanguageCode;
    std::string ListOfTagsToParseContentsFrom;
    bool SyncTOCOnHTMLPageNavigationComplete = false;
    bool GenerateHelpForTables = true;
    bool GenerateHelpForQueries = true;
    bool GenerateHelpForMacros = true;
    bool GenerateHelpForForms = true;
    bool GenerateHelpForReports = true;
    std::int32_t MSWordTOCLowerHeadingLevel = 0;
    bool AutomatedTestModeOn = false; ///< message boxes answer themselves
    bool UseProjectGroupAsSource = false;
    bool UnattendedExecution = false;
    bool WizardUnattendedExecution = false;
    bool VerboseTracing = false;
    bool AssociateHelpIndex = false;
    bool NoReportsScreenShots = false; ///< option `NoReportsScreenshots`
    bool HotSpots = false;             ///< option `AddHotSpots`
    std::int32_t IdentifyControls = 0; ///< 0 by caption, 1 by name; option `IdentifyBy`
    std::int32_t ImagesFormat = 0;     ///< 1 bitmap, else JPEG; option `SnapshotFormat`
    double ImagesScale = 1;            ///< pixels of a picture per pixel shown; option `SnapshotScale`
    bool BulletMenusControls = false;  ///< option `BulletedControlsAndMenus`
    std::string Website;
    std::string Copyright;
    std::string Organization;
    std::string RegistrationURL;    ///< option `Registration`
    std::string email;              ///< option `EMail`
    std::string ApplicationNameStr; ///< option `Application`
    std::string Charset;
    bool AddControlsListForMenuList = false;
    bool AddControlsSectionForMenuList = false;
    bool AddImageForForm = false;
    bool AddHotSpotsForForm = false;
    bool AddControlsListForForm = false;
    bool AddControlsSectionForForm = false;
    bool AddImageForReport = false;
    bool AddControlsListForReport = false;
    bool AddControlsSectionForReport = false;
    bool AddSearchTabToHelp = false;
    bool FillIndexFromAppObjectsAndControls = false;
    std::string Language;
    /// Where the copy of the compiled file goes; empty means beside the source project. No option of the
    /// store.
    std::string FolderForCopiedHelp;

    /// ".bmp" or ".jpg"; "bmp" or "jpg".
    std::string ImagesFileExt() const { return ImagesFormat == 1 ? ".bmp" : ".jpg"; }
    std::string ImagesType() const { return ImagesFormat == 1 ? "bmp" : "jpg"; }
    /// An empty one becomes the user's name at the first read and stays so.
    std::string Author() const;
    void SetAuthor(const std::string& value) { author_ = value; }
    /// A bare file name reads behind the current project's folder; empty stays empty.
    std::string CSSFullPath() const;
    void SetCSSFullPath(const std::string& value) { cssFullPath_ = value; }
    /// With one trailing backslash and no doubled ones but a network path's first two.
    std::string FolderForGeneratedHelp() const;
    void SetFolderForGeneratedHelp(const std::string& value) { folderForGeneratedHelp_ = value; }
    std::string FolderForGeneratedImages() const;
    /// Without a trailing backslash; never empty, "images" stands in.
    std::string NameOfFolderForGeneratedImages() const;
    std::string NameOfFolderForGeneratedImagesWithSlash() const;
    void SetNameOfFolderForGeneratedImages(const std::string& value);
    /// Of the current project.
    std::string CompiledHelpFullPath() const;
    std::string GeneratedHelpFileName() const { return "{{:GeneratedHelpFileName}}.chm"; }
    /// An empty name reads as the current project's, an empty title as the name.
    std::string HelpProjectName() const;
    void SetHelpProjectName(const std::string& value) { helpProjectName_ = value; }
    std::string HelpProjectTitle() const;
    void SetHelpProjectTitle(const std::string& value) { helpProjectTitle_ = value; }

    /// Replaces the project tags in the string, case-sensitively, and gives it back. Source location and name
    /// are asked of the host where a tag needs them; with the bypass the two arguments stand for them.
    std::string& ReplaceTags(std::string& ForString, bool vfByPassCallBack = false,
                             const std::string& vstrSourceProjectFolder = {},
                             const std::string& vstrSourceProjectName = {}) const;
    /// The same for a text that isn't kept.
    std::string ReplacedTags(std::string text) const { return std::move(ReplaceTags(text)); }

    std::unique_ptr<CTovimarParameters> Clone() const;

private:
    mutable std::string author_;
    std::string cssFullPath_;
    std::string folderForGeneratedHelp_;
    std::string nameOfFolderForGeneratedImages_ = "images\\";
    std::string helpProjectName_;
    std::string helpProjectTitle_;
};

} // namespace tovimar
