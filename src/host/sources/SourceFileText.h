#pragma once

#include <string>

namespace tovimar {

/// The text of a file of a source project: UTF-8 with or without mark, UTF-16 or the system's code page.
/// Raises kFailure1 "<path>: the file is larger than 16 MiB." and what reading raises.
std::string ReadSourceFile(const std::string& path);

/// Where a project's file lies: a path with a drive or on a network as it is, any other in the project's
/// folder, which ends in a backslash.
std::string SourceFilePath(const std::string& projectFolder, const std::string& path);

} // namespace tovimar
