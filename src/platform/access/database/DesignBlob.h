#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

/// The binary form of a form's or report's design, as a database keeps it in the stream "Blob" of the
/// object's folder: a stream of property records and of markers that open objects. Every level of objects
/// tells beforehand how many it holds, so that a design closes exactly at its last byte or is damaged.
namespace tovimar::platform::access {

/// What a record's value is; the numbers are the file's.
enum class ValueKind : std::uint16_t {
    Flag = 1, ///< without bytes in the slots below 48: not the default
    Byte = 2,
    Integer = 3,
    Long = 4,
    Float = 6,
    Double = 8,
    Guid = 9,
    Text = 10, ///< UTF-16, low byte first
    Binary = 11,
    LongText = 12,
    Macro = 17
};

/// One property. The slot is the property's place among those of its kind of object; the code is the same
/// for all kinds, 0xFFFF where the file leaves it out and the slot is an unknown one.
struct DesignRecord {
    std::uint32_t slot = 0;
    std::uint16_t code = 0;
    ValueKind type = ValueKind::Flag;
    std::string_view bytes; ///< within the blob
};

inline constexpr std::uint16_t kUnknownCode = 0xFFFF;

struct BlobObject {
    std::uint16_t type = 0; ///< 100 label ... 150 form, 151 report, see ObjectTypes
    std::vector<DesignRecord> records;
    std::vector<std::unique_ptr<BlobObject>> children;
};

struct DesignBlob {
    std::uint16_t version = 0;
    std::unique_ptr<BlobObject> root;
    bool closed = false;    ///< every list is full and nothing follows
    std::size_t unread = 0; ///< bytes behind the closing marker
};

/// Reads either encoding: the one with codes, and the compact one of the year 2000. The blob must outlive
/// the result. Codes come in the older numbering, whichever the file has.
/// Raises 0x80040001 "The design ...": ends too early, is nested deeper than 200, holds an unknown encoding.
DesignBlob ReadDesignBlob(std::string_view blob);

/// Puts the properties that came with later versions, which a file of the year 2000 keeps in a stream of
/// their own ("BlobDelta"), into the design; where the two trees differ the rest is left out.
void MergeDelta(DesignBlob& design, std::string_view delta);

} // namespace tovimar::platform::access
