#pragma once

#include <string>

namespace tovimar {
class CAddInProject;
}

namespace tovimar::cli {

/// A help project without its application, for commands that only look: a connected server, the project's
/// own options, and the project as the current one. Nothing of it is saved.
class ProjectReading {
public:
    /// A Windows path. Raises `Stop` when its options can't be read.
    explicit ProjectReading(const std::string& projectFile);
    ~ProjectReading();
    ProjectReading(const ProjectReading&) = delete;
    ProjectReading& operator=(const ProjectReading&) = delete;
};

} // namespace tovimar::cli
