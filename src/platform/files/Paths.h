#pragma once

#include <string>
#include <string_view>

/// Parts of Windows paths ("C:\Help\Orders.htm"). Nothing here looks at the disk. A slash counts as a
/// backslash when a path is taken apart.
namespace tovimar::platform {

/// "C:\Help\" of "C:\Help\Orders.htm"; empty without a folder part.
std::string FolderOf(std::string_view path);
/// "Orders.htm"; empty for a path that ends in a backslash.
std::string FileNameOf(std::string_view path);
/// "Orders": the file name without its last extension.
std::string BaseNameOf(std::string_view path);
/// ".htm" with its dot, as written; empty without one.
std::string ExtensionOf(std::string_view path);

/// An empty path stays empty.
std::string WithTrailingBackslash(std::string_view path);
std::string WithoutTrailingBackslash(std::string_view path);
/// Folder and name with one backslash between; an empty folder gives the name.
std::string Join(std::string_view folder, std::string_view name);

/// True for "C:..." and for network paths "\\server...".
bool HasDrive(std::string_view path);
/// True when there is a folder part, a drive alone included.
bool HasFolder(std::string_view path);

/// "*" and "?" as the platform has them, without regard to case; "*.*" and "" match every name.
bool MatchesPattern(std::string_view name, std::string_view pattern);

} // namespace tovimar::platform
