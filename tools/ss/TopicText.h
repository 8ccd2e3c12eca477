#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace tovimar::search {

/// A heading below the page's own one: a control, a field, a menu entry.
struct Section {
    std::string anchor; ///< empty when no link leads there
    std::string caption;
};

/// What a reader sees of a page. All texts are valid UTF-8 without control characters, single blanks
/// between words and blocks.
struct TopicText {
    std::string title; ///< of the title element, else the first heading; may be empty
    std::vector<Section> sections;
    std::string body; ///< visible text, headings included
};

/// Titles and captions longer than this are cut; so is what a hostile page can make the result list show.
inline constexpr std::size_t kLongestCaption = 200;

/// Reads a page: UTF-8 by its mark or its charset, else the charset's code page, 1252 without one.
/// Scripts, styles, comments and tags go, character references become characters. Any bytes will do;
/// time grows with their number only.
TopicText ReadTopic(std::string_view bytes);

} // namespace tovimar::search
