#pragma once

#include <string>
#include <unordered_map>

namespace tovimar::platform::access {

/// Texts of the table `tblDescription` of a database file, by the column `Key`, folded (`text::FoldCase`; the
/// first row of a key counts), from the column `Description`.
/// The file is read once in a process; a file that can't be read, a missing table or column give an empty
/// map. At most 100,000 rows and 64 MiB of text are taken. `nativePath` is a path of the machine.
const std::unordered_map<std::string, std::string>& ReadDescriptions(const std::string& nativePath);

/// Forgets what was read, so that the next question reads the file anew.
void ForgetDescriptions();

} // namespace tovimar::platform::access
