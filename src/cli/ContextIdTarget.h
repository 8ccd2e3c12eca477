#pragma once

#include "generation/SourceChanges.h"
#include "platform/AutomationObject.h"

#include <optional>
#include <string>

namespace tovimar::cli {

struct Arguments;

/// Where the new context ids of a run go. Nobody's sources change by an option of a project: ids go into
/// copies unless the originals were asked for. Outlives the application that it is attached to.
class ContextIdTarget {
public:
    /// Does nothing where the project wants no ids in its application.
    void Attach(const Arguments& arguments, const HostObject& application, SourceChanges::Earlier earlier);
    /// What was written, and what couldn't be. `source` is the application's native path.
    void Tell(const Arguments& arguments, const std::string& source) const;

private:
    void TellUnwritten(const std::string& source) const;

    std::optional<SourceChanges> changes_;
};

} // namespace tovimar::cli
