#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace tovimar::text {

/// The text, in UTF-8, of bytes that begin with a mark of UTF-8 or UTF-16; nothing without one.
std::optional<std::string> DecodeMarked(std::string_view bytes);

} // namespace tovimar::text
