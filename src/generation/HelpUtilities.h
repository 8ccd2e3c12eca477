#pragma once

#include "platform/Error.h"

#include <cstdint>
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

/// Opens a file or folder with its program for "open", or runs a program when parameters or waiting are asked
/// for. Above 32 for success, as the platform has it; else 31, or the failure of the start.
std::int32_t ShellExecute(const std::string& file, const std::string& verb, const std::string& parameters,
                          bool vfWait);
/// Runs a command line and waits for its end without limit. 0, or the failure of the start; the window style
/// is the platform's to heed.
ResultCode ShellAndWait(const std::string& command, std::int32_t windowStyle);

/// A warning with the exclamation icon, title "Tovimar Add-In".
void WarningDialog(const std::string& vstrText);

} // namespace tovimar
