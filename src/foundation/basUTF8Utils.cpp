#include "foundation/basUTF8Utils.h"

#include "platform/text/Text.h"

namespace tovimar {

std::vector<std::uint8_t> StringToUTF8(const std::string& text) {
    const std::string bytes = text::MakeValidUtf8(text);
    return {bytes.begin(), bytes.end()};
}

std::string UTF8ToString(const std::vector<std::uint8_t>& bytes) {
    return text::MakeValidUtf8(std::string(bytes.begin(), bytes.end()));
}

} // namespace tovimar
