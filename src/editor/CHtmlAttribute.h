#pragma once

#include <string>

namespace tovimar {

/// An attribute as it is to be written.
struct CHtmlAttribute {
    std::string Name;
    std::string Value;
};

} // namespace tovimar
