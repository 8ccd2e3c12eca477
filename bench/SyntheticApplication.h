#pragma once

#include <filesystem>

namespace tovimar::bench {

/// Writes text exports of an invented application: 6 of 10 objects are forms of 24 controls, 2 reports,
/// 1 a table, 1 a query. The same count gives the same bytes.
void WriteSyntheticApplication(const std::filesystem::path& folder, int objects);

/// Writes that many forms of 100 controls each: 42 text boxes and 3 combo boxes with their labels, 4 check
/// boxes and 6 command buttons, on a window of 756 by 661 pixels.
void WriteLargeForms(const std::filesystem::path& folder, int forms);

} // namespace tovimar::bench
