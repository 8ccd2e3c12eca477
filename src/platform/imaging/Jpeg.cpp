#include "platform/imaging/Jpeg.h"

#include <algorithm>
#include <memory>
#include <turbojpeg.h>
#include <type_traits>

namespace tovimar::platform {

namespace {

struct CloseTurbo {
    void operator()(void* handle) const { tjDestroy(handle); }
};
struct FreeTurbo {
    void operator()(unsigned char* bytes) const { tjFree(bytes); }
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
    unsigned char* target = nullptr;
    unsigned long length = 0;
    // Full colour resolution: text on coloured ground stays clear.
    const int failed = tjCompress2(turbo.get(), pixels, width, pitch, height, format, &target, &length,
                                   TJSAMP_444, std::clamp(quality, 1, 100), flags);
    const std::unique_ptr<unsigned char, FreeTurbo> owned(target);
    if (failed == 0)
        out.assign(reinterpret_cast<const char*>(target), length);
    else
        out.clear();
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
