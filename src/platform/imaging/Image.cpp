#include "platform/imaging/Image.h"

#include <algorithm>
#include <array>
#include <cairo.h>
#include <cstring>
#include <memory>
#include <turbojpeg.h>
#include <type_traits>

namespace tovimar::platform {

namespace {

constexpr int kLargestSide = 4096;
/// How far into an OLE picture or a metafile a picture is looked for.
constexpr std::size_t kLongestWrapper = std::size_t{64} * 1024 * 1024;

std::uint32_t Get16(std::string_view bytes, std::size_t at) {
    if (at + 2 > bytes.size())
        return 0;
    return static_cast<std::uint32_t>(static_cast<unsigned char>(bytes[at])) |
           static_cast<std::uint32_t>(static_cast<unsigned char>(bytes[at + 1])) << 8U;
}

std::uint32_t Get32(std::string_view bytes, std::size_t at) {
    return Get16(bytes, at) | Get16(bytes, at + 2) << 16U;
}

Image Sized(int width, int height) {
    Image image;
    image.width = width;
    image.height = height;
    image.pixels.assign(static_cast<std::size_t>(width) * static_cast<std::size_t>(height), 0);
    return image;
}

std::uint32_t Premultiplied(std::uint32_t alpha, std::uint32_t red, std::uint32_t green, std::uint32_t blue) {
    return alpha << 24U | (red * alpha / 255) << 16U | (green * alpha / 255) << 8U | (blue * alpha / 255);
}

/// A device-independent bitmap: header, colour table, rows.
class DibReader {
public:
    /// `bitsAt` is where the rows begin, 0 for behind the colour table.
    DibReader(std::string_view bytes, std::size_t bitsAt) : bytes_(bytes), bitsAt_(bitsAt) {}

    std::optional<Image> Read() {
        if (!ReadHeader() || !ReadPalette())
            return std::nullopt;
        const std::size_t line = (static_cast<std::size_t>(width_) * bits_ + 31) / 32 * 4;
        if (bitsAt_ > bytes_.size() || (bytes_.size() - bitsAt_) / line < static_cast<std::size_t>(height_))
            return std::nullopt;
        auto image = Sized(width_, height_);
        const bool alpha = bits_ == 32 && HasAlpha(line);
        for (int y = 0; y < height_; ++y) {
            const int row = topDown_ ? y : height_ - 1 - y;
            ReadRow(bytes_.substr(bitsAt_ + static_cast<std::size_t>(y) * line, line), alpha,
                    image.pixels.data() + static_cast<std::size_t>(row) * static_cast<std::size_t>(width_));
        }
        return image;
    }

private:
    bool ReadHeader() {
        headerLength_ = Get32(bytes_, 0);
        if (headerLength_ < 40 || headerLength_ > 124 || bytes_.size() < headerLength_)
            return false;
        width_ = static_cast<int>(Get32(bytes_, 4));
        height_ = static_cast<int>(Get32(bytes_, 8));
        topDown_ = height_ < 0 && height_ >= -kLargestSide;
        if (topDown_)
            height_ = -height_;
        bits_ = Get16(bytes_, 14);
        const auto compression = Get32(bytes_, 16);
        const bool known =
            bits_ == 1 || bits_ == 4 || bits_ == 8 || bits_ == 16 || bits_ == 24 || bits_ == 32;
        return known && (compression == 0 || compression == 3) && width_ > 0 && height_ > 0 &&
               width_ <= kLargestSide && height_ <= kLargestSide;
    }

    bool ReadPalette() {
        std::size_t at = headerLength_;
        if (Get32(bytes_, 16) == 3 && headerLength_ == 40)
            at += 12;
        if (bits_ <= 8) {
            auto used = static_cast<std::size_t>(Get32(bytes_, 32));
            const std::size_t all = std::size_t{1} << bits_;
            used = used == 0 ? all : std::min(used, all);
            for (std::size_t i = 0; i < used; ++i, at += 4)
                palette_[i] = 0xFF000000U | (Get32(bytes_, at) & 0xFFFFFFU);
        }
        if (bitsAt_ == 0)
            bitsAt_ = at;
        return at <= bytes_.size();
    }

    /// 32-bit bitmaps of old have a zero byte where newer ones have their alpha.
    bool HasAlpha(std::size_t line) const {
        const auto rows = bytes_.substr(bitsAt_, line * static_cast<std::size_t>(height_));
        for (std::size_t i = 3; i < rows.size(); i += 4)
            if (rows[i] != 0)
                return true;
        return false;
    }

    void ReadRow(std::string_view row, bool alpha, std::uint32_t* target) const {
        const auto byte = [&](std::size_t at) {
            return static_cast<std::uint32_t>(static_cast<unsigned char>(row[at]));
        };
        for (std::size_t x = 0; x < static_cast<std::size_t>(width_); ++x) {
            switch (bits_) {
            case 24:
                target[x] = Premultiplied(255, byte(3 * x + 2), byte(3 * x + 1), byte(3 * x));
                break;
            case 32:
                target[x] = Premultiplied(alpha ? byte(4 * x + 3) : 255, byte(4 * x + 2), byte(4 * x + 1),
                                          byte(4 * x));
                break;
            case 16: {
                const auto word = Get16(row, 2 * x);
                target[x] = Premultiplied(255, (word >> 10U & 31U) * 255 / 31, (word >> 5U & 31U) * 255 / 31,
                                          (word & 31U) * 255 / 31);
                break;
            }
            default: {
                const std::size_t bit = x * bits_;
                const auto shift = 8 - bits_ - bit % 8;
                target[x] = palette_[byte(bit / 8) >> shift & ((1U << bits_) - 1U)];
            }
            }
        }
    }

    std::string_view bytes_;
    std::size_t bitsAt_;
    std::size_t headerLength_ = 0;
    int width_ = 0, height_ = 0;
    std::size_t bits_ = 0;
    bool topDown_ = false;
    std::array<std::uint32_t, 256> palette_{};
};

struct Source {
    std::string_view bytes;
    std::size_t at = 0;
};

cairo_status_t ReadBytes(void* closure, unsigned char* data, unsigned int length) {
    auto& source = *static_cast<Source*>(closure);
    if (source.bytes.size() - source.at < length)
        return CAIRO_STATUS_READ_ERROR;
    std::memcpy(data, source.bytes.data() + source.at, length);
    source.at += length;
    return CAIRO_STATUS_SUCCESS;
}

std::uint32_t BigEndian32(std::string_view bytes, std::size_t at) {
    const auto little = Get32(bytes, at);
    return little << 24U | (little & 0xFF00U) << 8U | (little >> 8U & 0xFF00U) | little >> 24U;
}

std::optional<Image> DecodePng(std::string_view bytes) {
    // The size stands in the first chunk: a picture too large is never unpacked.
    const auto width = BigEndian32(bytes, 16), height = BigEndian32(bytes, 20);
    if (width == 0 || height == 0 || width > kLargestSide || height > kLargestSide)
        return std::nullopt;
    Source source{bytes};
    auto* surface = cairo_image_surface_create_from_png_stream(ReadBytes, &source);
    std::optional<Image> result;
    if (cairo_surface_status(surface) == CAIRO_STATUS_SUCCESS) {
        const bool opaque = cairo_image_surface_get_format(surface) == CAIRO_FORMAT_RGB24;
        result = Sized(cairo_image_surface_get_width(surface), cairo_image_surface_get_height(surface));
        const auto line = static_cast<std::size_t>(result->width);
        const auto stride = static_cast<std::size_t>(cairo_image_surface_get_stride(surface));
        for (std::size_t y = 0; y < static_cast<std::size_t>(result->height); ++y)
            std::memcpy(result->pixels.data() + y * line, cairo_image_surface_get_data(surface) + y * stride,
                        line * 4);
        if (opaque)
            for (auto& pixel : result->pixels)
                pixel |= 0xFF000000U;
    }
    cairo_surface_destroy(surface);
    return result;
}

struct CloseTurbo {
    void operator()(void* handle) const { tjDestroy(handle); }
};

std::optional<Image> DecodeJpeg(std::string_view bytes) {
    const std::unique_ptr<std::remove_pointer_t<tjhandle>, CloseTurbo> turbo(tjInitDecompress());
    int width = 0, height = 0, subsampling = 0, colorSpace = 0;
    const auto* source = reinterpret_cast<const unsigned char*>(bytes.data());
    const auto length = static_cast<unsigned long>(bytes.size());
    if (!turbo ||
        tjDecompressHeader3(turbo.get(), source, length, &width, &height, &subsampling, &colorSpace) != 0 ||
        width <= 0 || height <= 0 || width > kLargestSide || height > kLargestSide)
        return std::nullopt;
    auto image = Sized(width, height);
    // A picture that breaks off is shown as far as it goes; CMYK isn't.
    if (tjDecompress2(turbo.get(), source, length, reinterpret_cast<unsigned char*>(image.pixels.data()),
                      width, width * 4, height, TJPF_BGRA, 0) != 0 &&
        tjGetErrorCode(turbo.get()) != TJERR_WARNING)
        return std::nullopt;
    return image;
}

constexpr std::string_view kPngMark("\x89PNG\r\n\x1a\n", 8);
constexpr std::string_view kJpegMark("\xff\xd8\xff", 3);

std::optional<Image> DecodeBmp(std::string_view bytes) {
    const std::size_t bitsAt = Get32(bytes, 10);
    if (bytes.size() < 54 || bitsAt < 14)
        return std::nullopt;
    return DibReader(bytes.substr(14), bitsAt - 14).Read();
}

/// Bitmap within a record of a metafile that copies or stretches bits: where its header and bits stand.
std::optional<Image> DecodeRecordBitmap(std::string_view record, std::size_t offsets) {
    const std::size_t header = Get32(record, offsets), bits = Get32(record, offsets + 8);
    if (header >= record.size() || bits <= header)
        return std::nullopt;
    return DibReader(record.substr(header), bits - header).Read();
}

/// The largest bitmap that a metafile paints; drawings of lines and text have none.
std::optional<Image> DecodeMetafile(std::string_view bytes) {
    std::optional<Image> best;
    for (std::size_t at = 0; at + 8 <= bytes.size();) {
        const auto type = Get32(bytes, at);
        const std::size_t length = Get32(bytes, at + 4);
        if (length < 8 || length > bytes.size() - at)
            break;
        const auto record = bytes.substr(at, length);
        std::optional<Image> found;
        if (type == 81) // stretch bits
            found = DecodeRecordBitmap(record, 48);
        else if (type == 76 || type == 77) // copy bits
            found = DecodeRecordBitmap(record, 84);
        if (found && (!best || found->pixels.size() > best->pixels.size()))
            best = std::move(found);
        at += length;
    }
    return best;
}

/// Metafile header: type 1, and " EMF" 40 bytes on.
std::size_t FindMetafile(std::string_view bytes) {
    const auto mark = bytes.substr(0, 512).find(std::string_view(" EMF", 4));
    return mark == std::string_view::npos || mark < 40 ? std::string_view::npos : mark - 40;
}

std::optional<Image> DecodeKnown(std::string_view bytes) {
    if (bytes.starts_with(kPngMark))
        return DecodePng(bytes);
    if (bytes.starts_with(kJpegMark))
        return DecodeJpeg(bytes);
    if (bytes.starts_with("BM"))
        return DecodeBmp(bytes);
    if (const auto length = Get32(bytes, 0); length == 40 || length == 108 || length == 124)
        return DibReader(bytes, 0).Read();
    return std::nullopt;
}

} // namespace

std::optional<Image> DecodeImage(std::string_view bytes) {
    bytes = bytes.substr(0, kLongestWrapper);
    if (auto image = DecodeKnown(bytes))
        return image;
    if (const auto metafile = FindMetafile(bytes); metafile != std::string_view::npos)
        return DecodeMetafile(bytes.substr(metafile));
    // An OLE picture has its own header in front, of no fixed length.
    for (const auto mark : {kPngMark, kJpegMark})
        if (const auto at = bytes.substr(0, 4096).find(mark); at != std::string_view::npos && at > 0)
            return DecodeKnown(bytes.substr(at));
    return std::nullopt;
}

} // namespace tovimar::platform
