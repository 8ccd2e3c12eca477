#pragma once

#include <string>

namespace tovimar {

/// A free name beside `path` for the file that stands there while a new one is written: "a.htm" on
/// 17 October 2000 gives "a_20001017.htm", then "a_200010171.htm", ... The name isn't reserved.
std::string BackupFileName(const std::string& path);

/// Copies the file to such a name. False when that failed; a file that isn't there needs no copy.
bool BackUpFile(const std::string& path);

} // namespace tovimar
