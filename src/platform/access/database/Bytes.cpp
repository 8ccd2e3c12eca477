#include "platform/access/database/Bytes.h"

#include "platform/text/Text.h"

namespace tovimar::platform::access {

std::string FromUtf16Bytes(std::string_view bytes) {
    std::u16string units;
    units.reserve(bytes.size() / 2);
    for (std::size_t i = 0; i + 1 < bytes.size(); i += 2)
        units += static_cast<char16_t>(static_cast<std::uint8_t>(bytes[i]) |
                                       static_cast<std::uint8_t>(bytes[i + 1]) << 8U);
    return text::FromUtf16(units);
}

} // namespace tovimar::platform::access
