#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace tovimar::platform::access {

/// Properties of a form or report that can be written into its export; an empty one stays as it is.
struct HelpProperties {
    std::optional<std::int32_t> contextId; ///< "HelpContextId"
    std::optional<std::string> file;       ///< "HelpFile", UTF-8
};

/// The bytes of an export with these properties in it. All but their lines stays to the byte: encoding and
/// mark, line ends, indentation, order, checksums, code. A property that is there gets the new value, a new
/// one goes where the host itself writes it.
/// Raises 0x80040001 "<file>: ..." for bytes that hold no form or report.
std::string WithHelpProperties(std::string_view bytes, const HelpProperties& properties,
                               const std::string& nativePath);

} // namespace tovimar::platform::access
