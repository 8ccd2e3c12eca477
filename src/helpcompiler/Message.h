#pragma once

#include <functional>
#include <string>

namespace tovimar::helpcompiler {

/// Something to tell the author of a help project.
struct Message {
    enum class Kind {
        Complaint, ///< the project asks for what can't be had
        Warning    ///< a page, contents or index name something that isn't there
    };
    Kind kind = Kind::Warning;
    std::string file; ///< from the project's folder on; empty for the project as a whole
    int line = 0;     ///< from 1; 0 without one
    std::string text;
};

using Tell = std::function<void(const Message&)>;

} // namespace tovimar::helpcompiler
