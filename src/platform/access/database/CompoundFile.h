#pragma once

#include "platform/access/database/Storage.h"

#include <string_view>
#include <vector>

namespace tovimar::platform::access {

/// The folders and streams of an OLE compound file, as [MS-CFB] describes it; ids are the numbers of its
/// directory's entries, the root is its own parent. Chains of sectors that leave the file or lead in
/// circles end there.
/// Raises 0x80040001 "The compound file ..." for bytes that are none.
std::vector<StorageNode> ReadCompoundFile(std::string_view bytes);

} // namespace tovimar::platform::access
