#include "platform/imaging/Jpeg.h"

#include <algorithm>
#include <climits>
#include <memory>
#include <turbojpeg.h>
#include <type_traits>

namespace tovimar::platform {

namespace {

struct CloseTurbo {
    void operator()(void* handle) const { tjDestroy(handle); }
};
using Turbo = std::unique_ptr<std::remove_pointer_t<tjhandle>, CloseTurbo>;

int Encode(const std::uint8_t* pixels, int width, int height, int pitch, int format, int flags, int quality,
           std::string& out) {
    if (pixels == nullptr || width <= 0 || height <= 0)
        return JpegCode::kNoImage;
    if (width > 65500 || height > 65500)
        return JpegCode::kInvalidProperties;
    const Turbo turbo(tjInitCompress());
    if (!turbo)
        return JpegCode::kMemoryError;
    const auto bound = tjBufSize(width, height, TJSAMP_444);
    if (bound == static_cast<unsigned long>(-1))
        return JpegCode::kInvalidProperties;
    out.resize(bound);
    auto* target = reinterpret_cast<unsigned char*>(out.data());
    unsigned long length = bound;
    // Full colour resolution: text on coloured ground stays clear.
    const int failed = tjCompress2(turbo.get(), pixels, width, pitch, height, format, &target, &length,
                                   TJSAMP_444, std::clamp(quality, 1, 100), flags | TJFLAG_NOREALLOC);
    out.resize(failed == 0 ? length : 0);
    return failed == 0 ? JpegCode::kOk : JpegCode::kException;
}

} // namespace

int EncodeJpeg(const DibSection& section, int quality, std::string& out) {
    return Encode(section.bits, section.width, section.height, section.bytesPerLine, TJPF_BGR,
                  TJFLAG_BOTTOMUP, quality, out);
}

int EncodeJpeg(const Bitmap& bitmap, int quality, std::string& out) {
    return Encode(reinterpret_cast<const std::uint8_t*>(bitmap.pixels.data()), bitmap.width, bitmap.height,
                  bitmap.width * 4, TJPF_BGRX, 0, quality, out);
}

} // namespace tovimar::platform
