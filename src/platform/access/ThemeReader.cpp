#include "platform/access/ThemeReader.h"

#include "platform/text/Text.h"

#include <array>
#include <charconv>
#include <optional>
#include <pugixml.hpp>
#include <string>
#include <zlib.h>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kLargestEntry = 4'000'000;
constexpr std::string_view kEntryMark{"PK\x01\x02", 4};
constexpr std::string_view kEndMark{"PK\x05\x06", 4};
constexpr std::size_t kEntrySize = 46, kEndSize = 22, kLocalSize = 30;
constexpr unsigned kStored = 0, kDeflated = 8;

/// Little-endian numbers of a zip file; 0 beyond its end.
unsigned NumberAt(std::string_view bytes, std::size_t at, std::size_t size) {
    unsigned number = 0;
    for (std::size_t i = size; i-- > 0;)
        number = number << 8U | (at + i < bytes.size() ? static_cast<unsigned char>(bytes[at + i]) : 0U);
    return number;
}

std::optional<std::string> Inflated(std::string_view packed, std::size_t size) {
    std::string plain(size, '\0');
    z_stream stream{};
    // Entries are written without the library's own header.
    if (inflateInit2(&stream, -MAX_WBITS) != Z_OK)
        return std::nullopt;
    stream.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(packed.data()));
    stream.avail_in = static_cast<uInt>(packed.size());
    stream.next_out = reinterpret_cast<Bytef*>(plain.data());
    stream.avail_out = static_cast<uInt>(plain.size());
    const bool whole = inflate(&stream, Z_FINISH) == Z_STREAM_END && stream.avail_out == 0;
    inflateEnd(&stream);
    return whole ? std::optional<std::string>(std::move(plain)) : std::nullopt;
}

/// The content that an entry of the directory leads to.
std::optional<std::string> ContentOf(std::string_view zip, std::size_t entry) {
    const auto method = NumberAt(zip, entry + 10, 2);
    const std::size_t packed = NumberAt(zip, entry + 20, 4), size = NumberAt(zip, entry + 24, 4);
    const std::size_t local = NumberAt(zip, entry + 42, 4);
    const std::size_t begin =
        local + kLocalSize + NumberAt(zip, local + 26, 2) + NumberAt(zip, local + 28, 2);
    if (size > kLargestEntry || begin > zip.size() || packed > zip.size() - begin)
        return std::nullopt;
    const auto bytes = zip.substr(begin, packed);
    if (method == kStored)
        return std::string(bytes);
    return method == kDeflated ? Inflated(bytes, size) : std::nullopt;
}

std::optional<std::string> ReadEntry(std::string_view zip, std::string_view name) {
    const auto end = zip.rfind(kEndMark);
    if (end == std::string_view::npos || zip.size() - end < kEndSize)
        return std::nullopt;
    auto entry = static_cast<std::size_t>(NumberAt(zip, end + 16, 4));
    for (unsigned left = NumberAt(zip, end + 10, 2); left > 0; --left) {
        if (entry > zip.size() || zip.size() - entry < kEntrySize || zip.substr(entry, 4) != kEntryMark)
            return std::nullopt;
        const std::size_t length = NumberAt(zip, entry + 28, 2);
        if (text::EqualsIgnoringCase(zip.substr(entry + kEntrySize, length), name))
            return ContentOf(zip, entry);
        entry += kEntrySize + length + NumberAt(zip, entry + 30, 2) + NumberAt(zip, entry + 32, 2);
    }
    return std::nullopt;
}

/// `<a:srgbClr val="4F81BD"/>`, or a colour of the window system as it last was.
std::optional<std::uint32_t> ColorOf(const pugi::xml_node& node) {
    const std::string_view digits = node.child("a:srgbClr")
                                        ? node.child("a:srgbClr").attribute("val").value()
                                        : node.child("a:sysClr").attribute("lastClr").value();
    std::uint32_t color = 0;
    const auto result = std::from_chars(digits.data(), digits.data() + digits.size(), color, 16);
    const bool valid = digits.size() == 6 && result.ec == std::errc() && result.ptr == digits.data() + 6;
    return valid ? std::optional<std::uint32_t>(color) : std::nullopt;
}

} // namespace

std::vector<std::uint32_t> ReadThemeColors(std::string_view bytes) {
    constexpr std::array<const char*, 12> kNames{"a:dk1",     "a:lt1",     "a:dk2",     "a:lt2",
                                                 "a:accent1", "a:accent2", "a:accent3", "a:accent4",
                                                 "a:accent5", "a:accent6", "a:hlink",   "a:folHlink"};
    const auto xml = ReadEntry(bytes, "theme/theme/theme1.xml");
    pugi::xml_document document;
    if (!xml || !document.load_buffer(xml->data(), xml->size()))
        return {};
    const auto scheme = document.child("a:theme").child("a:themeElements").child("a:clrScheme");
    std::vector<std::uint32_t> colors;
    for (const auto* name : kNames) {
        const auto color = ColorOf(scheme.child(name));
        if (!color)
            return {};
        colors.push_back(*color);
    }
    return colors;
}

} // namespace tovimar::platform::access
