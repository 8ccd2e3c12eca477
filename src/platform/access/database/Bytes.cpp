#include "platform/access/database/Bytes.h"

#include "platform/text/Text.h"

namespace tovimar::platform::access {

std::string FromUtf16Bytes(std::string_view bytes) {
    std::u16string units(bytes.size() / 2, u'\0');
    for (std::size_t i = 0; i < units.size(); ++i)
        units[i] = static_cast<char16_t>(static_cast<std::uint8_t>(bytes[2 * i]) |
                                         static_cast<std::uint8_t>(bytes[2 * i + 1]) << 8U);
    return text::FromUtf16(units);
}

} // namespace tovimar::platform::access
