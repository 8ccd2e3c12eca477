#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace tovimar::search {

/// Text as searches compare it: compatibility forms taken apart, lower case, accents off (U+0300 to
/// U+036F), letters that don't take apart written with plain ones: "Größe" is "grosse", "Łódź" "lodz". The
/// search page's script folds what is typed by the same steps.
std::string Fold(std::string_view text);

/// Folded words in order: runs of letters, digits and marks; an ideograph or kana is a word of its own.
/// "Form_Orders" is two words, as a reader would type them. Words end after kLongestWord characters.
std::vector<std::string> WordsOf(std::string_view text);

inline constexpr std::size_t kLongestWord = 64;

} // namespace tovimar::search
