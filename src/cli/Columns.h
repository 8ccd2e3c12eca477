#pragma once

#include <cstddef>
#include <string>

namespace tovimar::cli {

/// With blanks behind up to `width` characters.
std::string PaddedTo(std::string text, std::size_t width);

} // namespace tovimar::cli
