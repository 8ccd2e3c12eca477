#include "Container.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace hhc {
namespace {

// Offsets in the container's header, in the header of its directory, and in a chunk of that.
constexpr std::size_t kStamp = 0x10;
constexpr std::size_t kSecondIdentifier = 0x28;
constexpr std::size_t kDirectoryOffset = 0x48;
constexpr std::size_t kContentOffset = 0x58;
constexpr std::size_t kHeaderLength = 0x60;
constexpr std::size_t kFirstChunk = 0x20;
constexpr std::size_t kDirectoryHeaderLength = 0x54;
constexpr std::size_t kPreviousChunk = 0x0C;
constexpr std::size_t kChunkHeaderLength = 0x14;

constexpr std::uint16_t kStampRecord = 10;

class Bytes {
public:
    explicit Bytes(std::string& bytes) : bytes_(bytes) {}
    bool Holds(std::uint64_t offset, std::uint64_t length) const {
        return offset <= bytes_.size() && length <= bytes_.size() - offset;
    }
    bool StartsAt(std::uint64_t offset, std::string_view signature) const {
        return Holds(offset, signature.size()) &&
               std::string_view(bytes_).substr(offset, signature.size()) == signature;
    }
    std::uint64_t Number(std::uint64_t offset, std::size_t length) const {
        std::uint64_t number = 0;
        for (std::size_t i = length; i-- > 0;)
            number = number << 8 | static_cast<unsigned char>(bytes_[offset + i]);
        return number;
    }
    void Put(std::uint64_t offset, std::uint32_t number) {
        for (std::size_t i = 0; i < 4; ++i)
            bytes_[offset + i] = static_cast<char>(number >> 8 * i & 0xff);
    }
    /// Number of seven bits per byte, the high bit on all but the last. `offset` moves behind it.
    std::optional<std::uint64_t> Packed(std::uint64_t& offset) const {
        std::uint64_t number = 0;
        for (int digits = 0; digits < 9 && Holds(offset, 1); ++digits) {
            const auto byte = static_cast<unsigned char>(bytes_[offset++]);
            number = number << 7 | (byte & 0x7fU);
            if (byte < 0x80)
                return number;
        }
        return std::nullopt;
    }
    std::size_t Find(std::string_view text, std::uint64_t from) const { return bytes_.find(text, from); }

private:
    std::string& bytes_;
};

/// FNV-1a: spreads well and needs nothing.
std::uint32_t HashOf(const std::string& bytes) {
    std::uint32_t hash = 2166136261U;
    for (const char byte : bytes)
        hash = (hash ^ static_cast<unsigned char>(byte)) * 16777619U;
    return hash;
}

/// Where the stamp stands among the records of the stream "/#SYSTEM", which isn't compressed.
std::optional<std::uint64_t> StampOfSystem(const Bytes& bytes, std::uint64_t directory) {
    constexpr std::string_view kEntry = "\x08/#SYSTEM";
    std::uint64_t place = bytes.Find(kEntry, directory);
    const std::uint64_t content = bytes.Number(kContentOffset, 8);
    if (place == std::string::npos || place > content)
        return std::nullopt;
    place += kEntry.size();
    const auto section = bytes.Packed(place);
    const auto offset = bytes.Packed(place);
    const auto length = bytes.Packed(place);
    if (section != 0U || !offset || !length || !bytes.Holds(content + *offset, *length))
        return std::nullopt;
    const std::uint64_t end = content + *offset + *length;
    for (std::uint64_t record = content + *offset + 4; record + 8 <= end;
         record += 4 + bytes.Number(record + 2, 2))
        if (bytes.Number(record, 2) == kStampRecord && bytes.Number(record + 2, 2) == 4)
            return record + 4;
    return std::nullopt;
}

} // namespace

bool SetRight(std::string& container) {
    Bytes bytes(container);
    if (!bytes.StartsAt(0, std::string_view("ITSF\x03\0\0\0", 8)) || !bytes.Holds(0, kHeaderLength))
        return false;
    const std::uint64_t directory = bytes.Number(kDirectoryOffset, 8);
    if (!bytes.StartsAt(directory, "ITSP") ||
        !bytes.Holds(directory, kDirectoryHeaderLength + kChunkHeaderLength))
        return false;
    const std::uint64_t chunk = directory + kDirectoryHeaderLength;
    constexpr std::uint64_t kNone = 0xffffffffU;
    if (bytes.StartsAt(chunk, "PMGL") && bytes.Number(chunk + kPreviousChunk, 4) == kNone)
        bytes.Put(directory + kFirstChunk, 0);
    container[kSecondIdentifier] = '\x11';

    const auto stamp = StampOfSystem(bytes, directory);
    bytes.Put(kStamp, 0);
    if (stamp)
        bytes.Put(*stamp, 0);
    const std::uint32_t hash = HashOf(container);
    bytes.Put(kStamp, hash);
    if (stamp)
        bytes.Put(*stamp, hash);
    return true;
}

} // namespace hhc
