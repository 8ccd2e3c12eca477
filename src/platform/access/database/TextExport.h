#pragma once

#include <functional>
#include <string>
#include <vector>

/// A database's objects as text exports, in the layout of the newer version-control tools: one file per
/// object, "forms/Orders.form" with the code beside it in "forms/Orders.cls", "reports/*.report",
/// "macros/*.macro", "modules/*.bas" and "*.cls", "queries/*.sql". UTF-8 with its mark, lines ended by CRLF.
namespace tovimar::platform::access {

struct ExportedFile {
    std::string path; ///< relative, "/" between its parts; characters that no file's name holds as "%3A"
    std::string bytes;
};

/// Hands over each file; the names of a kind come sorted. What can't be read gives a sentence of the result
/// and no file. Raises as OpenAccessApplication for a file that is no database.
std::vector<std::string> ExportDatabase(const std::string& nativePath,
                                        const std::function<void(const ExportedFile&)>& take);

/// File name for an object: what DecodeObjectName reads back.
std::string EncodeObjectName(const std::string& name);

} // namespace tovimar::platform::access
