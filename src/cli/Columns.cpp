#include "cli/Columns.h"

#include "platform/text/Text.h"

namespace tovimar::cli {

std::string PaddedTo(std::string text, std::size_t width) {
    const std::size_t length = text::Length(text);
    return length < width ? text + std::string(width - length, ' ') : text;
}

} // namespace tovimar::cli
