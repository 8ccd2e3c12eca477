#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

/// What was made of a contents file whose markup is no XML: its lists, objects and parameters alone,
/// balanced, with tags in upper case. A fault leaves the text empty.
struct RepairedSitemap {
    std::string text;
    std::string reason;    ///< empty without a fault
    std::int32_t line = 0; ///< of the fault, from 1; 0 when no line is to blame
};

/// Reads tags wherever they stand, in any case, with values in double quotes, single quotes or none. A list
/// that isn't closed ends with the file, an end without a beginning goes, and so does an object outside of
/// all lists that describes the file. Faults: a tag, comment or entry that isn't closed, lists more than 400
/// deep, a file without entries.
RepairedSitemap RepairSitemap(const std::string& text);

} // namespace tovimar
