#pragma once

#include "platform/access/database/Storage.h"

#include <string>

namespace tovimar::platform::access {

/// Reads the storage of a database, in a child process as ReadDatabase does: streams longer than 64 MiB are
/// cut, folders above 100,000 left out. Empty for a database that keeps none (1997 and older).
/// Raises 0x80040001 "<path>: <reason>" for a file that can't be read.
Storage ReadStorage(const std::string& nativePath);

} // namespace tovimar::platform::access
