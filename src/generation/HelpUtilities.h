#pragma once

#include <string>
#include <vector>

/// Small operations that the steps of a generation share.
namespace tovimar {

/// The `link` element of a page's style sheet: its file name without the folder. Empty for an empty path.
std::string GetStyleSheetLinkHtml(const std::string& vstrCSSFullPath);

/// Copies a template: reads it, replaces project tags, then each tag of the list (entries "tag|value",
/// trimmed, without regard to case), then the message parameters; writes the text to the target, if one is
/// given, and returns it. A missing template gives an empty text. Raises 0x80040001 "Error saving file
/// <target>".
std::string ReplaceTagsAndCopy(const std::string& vstrTemplateFullPath, const std::string& vstrTargetFullPath,
                               const std::vector<std::string>& rcolTags);

/// Makes the folder with all missing parents; true when it stands afterwards.
bool CreateFolderPath(const std::string& vstrPath);
/// True when a file "test.txt" could be made in the folder; it is deleted again.
bool TestFolderWritable(const std::string& vstrFolder);

/// Folder of the help compiler hhc.exe with a trailing backslash; empty when it isn't installed.
std::string GetHtmlHelpWorkshopExePath();

/// A warning with the exclamation icon, title "Tovimar Add-In".
void WarningDialog(const std::string& vstrText);

} // namespace tovimar
