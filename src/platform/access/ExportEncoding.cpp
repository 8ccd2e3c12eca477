#include "platform/access/ExportEncoding.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <array>

namespace tovimar::platform::access {

ExportEncoding FindExportEncoding(std::string_view bytes) {
    if (bytes.starts_with("\xFF\xFE"))
        return ExportEncoding::Utf16Little;
    if (bytes.starts_with("\xFE\xFF"))
        return ExportEncoding::Utf16Big;
    // No other text encoding has zero bytes in its start.
    const auto start = bytes.substr(0, std::min<std::size_t>(bytes.size() & ~std::size_t{1}, 256));
    std::array<std::size_t, 2> zeros{};
    for (std::size_t i = 0; i < start.size(); ++i)
        if (start[i] == '\0')
            ++zeros[i % 2];
    const std::size_t many = start.size() / 4;
    if (many > 0 && zeros[1] > many && zeros[0] == 0)
        return ExportEncoding::Utf16Little;
    if (many > 0 && zeros[0] > many && zeros[1] == 0)
        return ExportEncoding::Utf16Big;
    const bool marked = bytes.starts_with("\xEF\xBB\xBF");
    return marked || text::IsValidUtf8(bytes) ? ExportEncoding::Utf8 : ExportEncoding::Ansi;
}

} // namespace tovimar::platform::access
