#pragma once

#include "generation/FolderOperations.h"

#include <cstdint>
#include <string>
#include <vector>

/// Small operations that the steps of a generation share.
namespace tovimar {

class CHelpPrjTreeNode;

/// The `link` element of a page's style sheet: its file name without the folder. Empty for an empty path.
std::string GetStyleSheetLinkHtml(const std::string& vstrCSSFullPath);

/// Copies a template: reads it, replaces project tags, then each tag of the list (entries "tag|value",
/// trimmed, without regard to case), then the message parameters; writes the text to the target, if one is
/// given, and returns it. A missing template gives an empty text. Raises 0x80040001 "Error saving file
/// <target>".
std::string ReplaceTagsAndCopy(const std::string& vstrTemplateFullPath, const std::string& vstrTargetFullPath,
                               const std::vector<std::string>& rcolTags);

/// Folder of the help compiler hhc.exe with a trailing backslash; empty when it isn't installed.
std::string GetHtmlHelpWorkshopExePath();

/// Index of a tree view's image by its key, without regard to case; 0 for an unknown one.
std::int32_t GetTreeIconIndex(const std::string& vstrKey);
/// Gives the node's entry in the view the image of its state; nothing without an entry.
void SetTreeNodeIcon(CHelpPrjTreeNode& node);
/// The name begins with "Form_", "Report_", either.
bool IsFormModuleName(const std::string& vstrName);
bool IsReportModuleName(const std::string& vstrName);
bool IsFormOrReportModuleName(const std::string& vstrName);
/// The `style` element that zooms a page by a text such as "120%"; empty for an empty text.
std::string GetZoomStyleHtml(const std::string& vstrPercent);
/// The first 32 characters of a longer text, with "..." behind.
std::string ShortenCaption(const std::string& vstrText);
/// Split at "|"; an empty text has no parts.
std::vector<std::string> SplitToList(const std::string& vstrText);
/// Takes the file's own folder out of its links. True when there was one.
bool SetRelativePath(const std::string& vstrPath);

/// A warning with the exclamation icon, title "Tovimar Add-In".
void WarningDialog(const std::string& vstrText);

} // namespace tovimar
