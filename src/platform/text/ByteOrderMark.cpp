#include "platform/text/ByteOrderMark.h"

#include "platform/text/Text.h"

namespace tovimar::text {

std::optional<std::string> DecodeMarked(std::string_view bytes) {
    if (bytes.starts_with("\xEF\xBB\xBF"))
        return MakeValidUtf8(bytes.substr(3));
    const bool bigEndian = bytes.starts_with("\xFE\xFF");
    if (!bigEndian && !bytes.starts_with("\xFF\xFE"))
        return std::nullopt;
    std::u16string units;
    units.reserve(bytes.size() / 2);
    for (std::size_t i = 2; i + 1 < bytes.size(); i += 2) {
        const auto first = static_cast<unsigned char>(bytes[i]);
        const auto second = static_cast<unsigned char>(bytes[i + 1]);
        units += static_cast<char16_t>(bigEndian ? first << 8U | second : second << 8U | first);
    }
    return FromUtf16(units);
}

} // namespace tovimar::text
