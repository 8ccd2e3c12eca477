#pragma once

#include <string>

/// Pieces that project file, contents, index and web help write alike.
namespace tovimar {

inline constexpr const char* kCrLf = "\r\n";

/// A caption as sitemap values hold it: entities decoded, double quotes removed, encoded again.
std::string HhcCaption(const std::string& text);

/// True when the project names objects and controls by their names instead of their captions.
bool IdentifiedByName();

/// Replaces the file by `text` and one line end, in the ANSI code page; a character that the page can't
/// hold goes as a numeric reference, which the help compiler and every browser read back.
void PrintSitemap(const std::string& path, std::string text);

/// The read-only state of a file for the detail of an error report; False for one that doesn't exist.
bool ExistsAndReadOnly(const std::string& path);
/// "READ_ONLY = True" or "READ_ONLY = False".
std::string ReadOnlyDetail(bool readOnly);

} // namespace tovimar
