#pragma once

#include <string>
#include <string_view>

namespace tovimar::platform::access {

/// The file in a cell of an attachment: as it is, or packed behind two numbers (is it packed, its length);
/// unpacked it begins with a head of its own that tells its length and the file's extension.
/// Empty for bytes that are none, or unpack to more than 64 MiB.
std::string AttachmentContent(std::string_view cell);

} // namespace tovimar::platform::access
