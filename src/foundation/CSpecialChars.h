#pragma once

#include <string>
#include <string_view>

namespace tovimar {

/// The 252 character entities of HTML 4, in whole forms: "&nbsp;" and "&#160;". A name is looked up as it is
/// written and, failing that, without regard to case. Cheap to make: the table is static.
class CSpecialChars {
public:
    /// "&#160;" for "&nbsp;"; empty for a name that isn't known.
    std::string GetNumCode(std::string_view name) const;
    /// "&nbsp;" for "&#160;"; empty for a code that isn't in the table.
    std::string GetCharCode(std::string_view code) const;

    /// The character of a named entity "&nbsp;", 0 when it isn't known.
    static char32_t CharacterOf(std::string_view name);
    /// The longest form, "&thetasym;": how far a look for the ";" goes.
    static constexpr std::size_t kLongest = 10;
};

} // namespace tovimar
