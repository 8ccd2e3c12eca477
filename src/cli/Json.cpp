#include "cli/Json.h"

#include "cli/Console.h"

#include <nlohmann/json.hpp>

namespace tovimar::cli {

void PrintJson(const nlohmann::ordered_json& json) {
    PrintRaw(json.dump(2, ' ', /*ensure_ascii=*/false, nlohmann::ordered_json::error_handler_t::replace) +
             "\n");
}

} // namespace tovimar::cli
