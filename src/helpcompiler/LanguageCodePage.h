#pragma once

#include <cstdint>
#include <string_view>

namespace tovimar::helpcompiler {

/// English (United States), for projects that don't name a language: a compiled help without one finds
/// nothing on searching.
constexpr std::uint32_t kDefaultLanguage = 0x409;

/// The number at the start of "0x419 Russian"; the default for a text without one.
std::uint32_t LanguageOf(std::string_view text);
/// Code page of the language's texts on its own systems; 1252 for languages that aren't known.
int CodePageOfLanguage(std::uint32_t language);

} // namespace tovimar::helpcompiler
