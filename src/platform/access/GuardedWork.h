#pragma once

#include <functional>
#include <string>

namespace tovimar::platform::access {

/// Runs work that may crash, hang or print in a child process, and gives the text that it made (at most
/// 256 MiB). What the work writes to the standard streams is dropped. A RaisedError of the work is raised
/// here with its text; a child that dies, or takes more than a minute, raises 0x80040001 with
/// "<path>: the file is damaged and can't be read.".
std::string RunGuarded(const std::string& nativePath, const std::function<std::string()>& work);

} // namespace tovimar::platform::access
