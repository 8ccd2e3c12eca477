#include "Packing.h"

#include <zlib.h>

#include <algorithm>
#include <array>
#include <cstdint>
#include <stdexcept>

namespace tovimar::search {

const std::string_view kPackingLetters =
    "!#$%()*+,-./0123456789:;=>?@ABCDEFGHIJKLMNOPQRSTUVWXYZ[]^_`abcdefghijklmnopqrstuvwxyz";

namespace {

constexpr std::size_t kGroup = 4;
constexpr std::uint32_t kBase = 85;
constexpr int kRawWindow = -15; ///< the largest window, without a header

std::string Deflated(std::string_view text) {
    z_stream stream{};
    if (deflateInit2(&stream, Z_BEST_COMPRESSION, Z_DEFLATED, kRawWindow, MAX_MEM_LEVEL,
                     Z_DEFAULT_STRATEGY) != Z_OK)
        throw std::runtime_error("not enough memory to pack the index");
    std::string packed(deflateBound(&stream, static_cast<uLong>(text.size())), '\0');
    // The library doesn't write through its input pointer, which isn't const in older versions.
    stream.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(text.data()));
    stream.avail_in = static_cast<uInt>(text.size());
    stream.next_out = reinterpret_cast<Bytef*>(packed.data());
    stream.avail_out = static_cast<uInt>(packed.size());
    const int result = deflate(&stream, Z_FINISH);
    packed.resize(stream.total_out);
    deflateEnd(&stream);
    if (result != Z_STREAM_END)
        throw std::runtime_error("the index can't be packed");
    return packed;
}

} // namespace

std::string Pack(std::string_view text) {
    const auto bytes = Deflated(text);
    std::string out;
    out.reserve(bytes.size() * 5 / 4 + 5);
    for (std::size_t at = 0; at < bytes.size(); at += kGroup) {
        const auto count = std::min(kGroup, bytes.size() - at);
        std::uint32_t value = 0;
        for (std::size_t i = 0; i < kGroup; ++i)
            value = value << 8U | (i < count ? static_cast<unsigned char>(bytes[at + i]) : 0U);
        std::array<char, kGroup + 1> digits{};
        for (auto digit = digits.rbegin(); digit != digits.rend(); ++digit, value /= kBase)
            *digit = kPackingLetters[value % kBase];
        // The reader fills a short group with the highest digit, so its first bytes come out whole.
        out.append(digits.data(), count + 1);
    }
    return out;
}

} // namespace tovimar::search
