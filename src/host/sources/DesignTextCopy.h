#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

/// What the list of source objects needs of the text copy of a form's or report's design.
struct DesignTextCopy {
    std::string caption;
    /// Objects of the same kind that it shows inside itself.
    std::vector<std::string> subforms;
};

/// Reads the text up to the code behind the design. `typeWord` is "Form" or "Report"; without
/// one any object begins the design, and only its caption is read.
DesignTextCopy ParseDesignTextCopy(std::string_view text, std::string_view typeWord);

} // namespace tovimar
