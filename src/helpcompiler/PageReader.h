#pragma once

#include "helpcompiler/SearchIndex.h"
#include "platform/text/Text.h"

#include <string>
#include <string_view>
#include <vector>

namespace tovimar::helpcompiler {

/// A place of a page that names another file.
struct PageReference {
    enum class Kind {
        Link,  ///< leads there when somebody asks for it
        Needed ///< belongs to the page: picture, style sheet, script, frame
    };
    Kind kind = Kind::Link;
    std::string target; ///< as written, character references decoded, without blanks at its ends
    int line = 1;
};

struct PageContent {
    std::string title; ///< in one line; empty without one
    PageWords words;
    std::vector<PageReference> references;
};

/// What the help compiler needs of a page, whose bytes are of the code page already. Anything can be read.
PageContent ReadPage(std::string_view bytes, const text::CodePage& page);

/// The files that a style sheet asks for: `url(...)` and `@import "..."`.
std::vector<PageReference> ReadStyleSheet(std::string_view bytes, int firstLine = 1);

} // namespace tovimar::helpcompiler
