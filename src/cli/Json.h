#pragma once

#include <nlohmann/json_fwd.hpp>

namespace tovimar::cli {

/// On standard output, indented, keys in the order of their making. Bytes that are no UTF-8 are replaced.
void PrintJson(const nlohmann::ordered_json& json);

} // namespace tovimar::cli
