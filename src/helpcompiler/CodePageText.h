#pragma once

#include "platform/text/Text.h"

#include <string>
#include <string_view>

/// Brings what stands in UTF-8 or UTF-16 to the code page of the help: the viewer's search and its lists know
/// no other text. Characters that the code page can't hold are written as references.
namespace tovimar::helpcompiler {

/// A page, contents or index file: as it is unless it has a mark or names UTF-8 as its charset. The charset
/// that it names becomes that of the code page; in scripts and style sheets escapes stand for characters that
/// can't be held.
std::string InCodePage(std::string_view bytes, const text::CodePage& page);

/// "windows-1251", "shift_jis"
std::string CharsetName(int codePage);

} // namespace tovimar::helpcompiler
