#pragma once

#include <string>

namespace tovimar::cli {

/// One `NAME=VALUE` of the command line.
struct OptionAssignment {
    std::string name; ///< as the option spells it
    std::string value;
    std::string complaint; ///< why it isn't understood; empty for a good one
};

/// Names ignore case. An unknown name gets the nearest ones suggested, a bad value the good ones.
OptionAssignment ParseOption(const std::string& assignment);

} // namespace tovimar::cli
