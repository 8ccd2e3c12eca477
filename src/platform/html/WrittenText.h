#pragma once

#include <cstddef>
#include <string_view>

namespace tovimar {

/// True when `source` is plain text of a page, entities included, that reads as `text`. False when in doubt.
bool IsWrittenAs(std::string_view text, std::string_view source);

/// The same for text that knows no entities, in which "<" may stand: only line ends differ.
bool IsTextWithLineEnds(std::string_view text, std::string_view source);

/// White space of a page's end, line ends counted once, outside tags and comments; 0 when anything but space
/// and tags stands there.
std::size_t SpacesOutsideTags(std::string_view tail);

} // namespace tovimar
