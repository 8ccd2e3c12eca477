#include "platform/access/database/Attachment.h"

#include "platform/Error.h"
#include "platform/access/database/Bytes.h"

#include <zlib.h>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kLongest = std::size_t{64} << 20U;
/// What packing can gain at most, by the algorithm's own arithmetic.
constexpr std::size_t kHighestRatio = 1040;

std::string Unpacked(std::string_view packed, std::size_t size) {
    if (size > kLongest || size > packed.size() * kHighestRatio)
        return {};
    std::string plain(size, '\0');
    auto length = static_cast<uLongf>(size);
    const int result =
        uncompress(reinterpret_cast<Bytef*>(plain.data()), &length,
                   reinterpret_cast<const Bytef*>(packed.data()), static_cast<uLong>(packed.size()));
    if (result != Z_OK)
        return {};
    plain.resize(length);
    return plain;
}

} // namespace

std::string AttachmentContent(std::string_view cell) {
    try {
        ByteReader reader(cell, "The attachment");
        const bool isPacked = reader.U32() == 1;
        const auto size = reader.U32();
        const auto rest = reader.Take(reader.Left());
        const std::string content = isPacked ? Unpacked(rest, size) : std::string(rest);
        ByteReader head(content, "The attachment");
        const auto headSize = head.U32();
        head.Skip(headSize < 4 ? 0 : headSize - 4);
        return std::string(head.Take(head.Left()));
    } catch (const RaisedError&) {
        return {};
    }
}

} // namespace tovimar::platform::access
