#pragma once

#include <filesystem>

namespace tovimar::bench {

/// Writes text exports of an invented application: 6 of 10 objects are forms of 24 controls, 2 reports,
/// 1 a table, 1 a query. The same count gives the same bytes.
void WriteSyntheticApplication(const std::filesystem::path& folder, int objects);

} // namespace tovimar::bench
