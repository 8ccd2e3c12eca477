#pragma once

#include <string>

namespace tovimar::cli {

/// An option and the value it is to have, as they were typed.
struct OptionAssignment {
    std::string name; ///< as the option spells it
    std::string value;
    std::string complaint; ///< why it isn't understood; empty for a good one
};

/// `NAME=VALUE`. Names ignore case. An unknown name gets the nearest ones suggested, a bad value the good
/// ones.
OptionAssignment ParseOption(const std::string& assignment);
OptionAssignment ParseOption(const std::string& name, const std::string& value);
/// The name alone.
OptionAssignment FindOption(const std::string& name);

} // namespace tovimar::cli
