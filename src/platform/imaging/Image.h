#pragma once

#include "platform/imaging/Bitmap.h"

#include <optional>
#include <string_view>

namespace tovimar::platform {

/// A decoded picture for painting: 0xAARRGGBB, colours multiplied by their alpha, rows from the top.
struct Image : Bitmap {};

/// Decodes a picture as designs embed it: a device-independent bitmap without file header, a BMP, PNG or
/// JPEG file, the largest bitmap of an enhanced metafile. None for every other format, for damaged
/// bytes and for more than 4096 pixels a side.
std::optional<Image> DecodeImage(std::string_view bytes);

} // namespace tovimar::platform
