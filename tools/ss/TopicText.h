#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace tovimar::search {

/// What a reader sees of a page.
struct TopicText {
    std::string title; ///< of the title element, else the first heading; may be empty
    std::string body;  ///< visible text, blanks between blocks
};

/// Reads a page: UTF-8 by its mark or its charset, else the charset's code page, 1252 without one.
/// Scripts, styles, comments and tags go, character references become characters.
TopicText ReadTopic(std::string_view bytes);

/// Words in lower case, in order: runs of letters and digits; an ideograph is a word of its own.
/// "Form_Orders" is two words, as a reader would type them.
std::vector<std::string> WordsOf(std::string_view text);

} // namespace tovimar::search
