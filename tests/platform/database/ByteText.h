#pragma once

#include "platform/text/Text.h"

#include <cstdint>
#include <string>
#include <string_view>

/// Bytes of a database's storage, put together as they lie in the file.
namespace tovimar::platform::access {

inline std::string Le(std::uint64_t number, int size) {
    std::string bytes;
    for (int i = 0; i < size; ++i)
        bytes += static_cast<char>(number >> (8 * i) & 0xFFU);
    return bytes;
}
inline std::string Le16(std::uint64_t number) {
    return Le(number, 2);
}
inline std::string Le32(std::uint64_t number) {
    return Le(number, 4);
}
inline std::string Wide(std::string_view text) {
    std::string bytes;
    for (const char16_t unit : text::ToUtf16(text))
        bytes += Le16(unit);
    return bytes;
}

/// A design in the encoding with codes, item by item.
class BlobText {
public:
    explicit BlobText(int rootType, int version = 0x14)
        : bytes(Le16(static_cast<std::uint64_t>(version)) + Le16(0x14) + Le32(0) +
                Le16(static_cast<std::uint64_t>(rootType))) {}

    BlobText& Record(int slot, int code, int type, std::string_view value) {
        bytes += Le32(static_cast<std::uint64_t>(slot)) + Le16(static_cast<std::uint64_t>(code)) +
                 Le32(static_cast<std::uint64_t>(type)) + Le32(4) + Le32(value.size());
        bytes += value;
        return *this;
    }
    BlobText& Flag(int slot, int code) { return Record(slot, code, 1, {}); }
    BlobText& Short(int slot, int code, int value) {
        return Record(slot, code, 3, Le16(static_cast<std::uint64_t>(value)));
    }
    BlobText& Text(int slot, int code, std::string_view value) { return Record(slot, code, 10, Wide(value)); }
    /// A list of so many objects; the first one opens.
    BlobText& List(int count, int type) {
        bytes +=
            Le32(0xFF) + Le16(static_cast<std::uint64_t>(count)) + Le16(static_cast<std::uint64_t>(type));
        return *this;
    }
    BlobText& Only(int type) {
        bytes += Le32(0xFE) + Le16(static_cast<std::uint64_t>(type));
        return *this;
    }
    BlobText& Next(int type) {
        bytes += Le32(0xFD) + Le16(static_cast<std::uint64_t>(type));
        return *this;
    }
    std::string End() const { return bytes + Le32(0xFD); }

    std::string bytes;
};

} // namespace tovimar::platform::access
