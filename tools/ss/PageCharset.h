#pragma once

#include <string>
#include <string_view>

namespace tovimar::search {

/// The page as UTF-8: by its mark or the charset that its head names, else as code page 1252.
std::string DecodePage(std::string_view bytes);

/// Position of a lower case ASCII text without regard to case, npos when absent.
std::size_t FindAscii(std::string_view page, std::string_view lower, std::size_t from);

/// What a character reference without "&" and ";" stands for, such as "amp" or "#1041"; empty for one that
/// isn't known.
std::string CharacterOf(std::string_view reference);

} // namespace tovimar::search
