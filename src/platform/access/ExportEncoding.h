#pragma once

#include <string_view>

namespace tovimar::platform::access {

/// What a text export's bytes are. A mark stays among the bytes.
enum class ExportEncoding { Utf8, Ansi, Utf16Little, Utf16Big };

/// UTF-16 by its mark or by zero bytes, UTF-8 by its mark or where all bytes are well-formed, else ANSI.
ExportEncoding FindExportEncoding(std::string_view bytes);

} // namespace tovimar::platform::access
