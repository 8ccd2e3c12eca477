#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <string>
#include <vector>

namespace tovimar {

/// Narrows the catalogue to the help projects of the source project at hand, and makes one of them, or a
/// project file from elsewhere, the current one.
class CHelpPrjSelector {
public:
    /// Reads the projects of the source project at hand. 0, or the failure, which is reported.
    ResultCode Init();
    void Terminate();

    /// Paths of the project files, the latest first.
    const std::vector<std::string>& ExistingProjects() const { return existing_; }
    std::int32_t ExistingProjectsCount() const { return static_cast<std::int32_t>(existing_.size()); }

    /// Makes the project of that file current; an empty path takes the first one of the source project. A
    /// file that the catalogue doesn't know is listed under what stands in it. A project that is open in the
    /// generator is saved and closed first. With `vfSetHelpTreeObject` the generator loads the project's
    /// tree. 0; 0x8003FE09 when there is no such project (a warning names a file that is missing); or the
    /// failure of loading the file.
    ResultCode SetCurrent(const std::string& vstrProjectDefFullPath = {},
                          bool vfLoadingExternalProject = false, bool vfSetHelpTreeObject = false);

private:
    std::vector<std::string> existing_;
};

} // namespace tovimar
