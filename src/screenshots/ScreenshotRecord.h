#pragma once

#include "screenshots/Screenshot.h"

namespace tovimar {

/// The files of one documented object of the loaded project.
struct Screenshot::FormRecord {
    std::string Name;
    std::string SnapshotFormat;
    std::string htmlFullPath;
    std::string picFullPath;
};

} // namespace tovimar
