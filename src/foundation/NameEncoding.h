#pragma once

#include <string>

namespace tovimar {

/// Transliterates a name into one that is safe as a file name and as an anchor, character by character by
/// the table "ObjectNameEncoding.xml" of the settings folder. A character without an entry stands for
/// itself; so does every one when the table is missing. The table is read once.
std::string NormalizeName(const std::string& text);

/// The next NormalizeName reads the table anew, for a change of the environment.
void ForgetNameEncodingTable();

} // namespace tovimar
