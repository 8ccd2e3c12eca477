#pragma once

#include "platform/access/database/Storage.h"

#include <string>
#include <vector>

namespace tovimar::platform::access {

/// A theme or shared picture that the database keeps for its forms and reports.
struct StoredResource {
    std::string type; ///< "thmx", "img"
    std::string name;
    std::string extension; ///< without the point
    std::string bytes;     ///< of the file
};

struct StoredDesigns {
    Storage tree;
    std::vector<StoredResource> resources;
    std::string themeName; ///< of the theme in use; empty where the database names none
};

/// Reads the storage of a database, in a child process as ReadDatabase does: streams longer than 64 MiB are
/// cut, folders above 100,000 left out. The tree is empty for a database that keeps none (1997 and older).
/// Raises 0x80040001 "<path>: <reason>" for a file that can't be read.
StoredDesigns ReadStorage(const std::string& nativePath);

} // namespace tovimar::platform::access
