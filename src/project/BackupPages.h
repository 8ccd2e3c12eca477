#pragma once

#include <string>
#include <vector>

namespace tovimar {

class CHelpPrjTree;

/// Of the page names of a help folder those that `BackupFileName` gave: "a_20001017.htm" beside "a.htm". They
/// are the writer's, on the disk, and no reader's: neither the compiled help nor the search has them. A page
/// of such a name that is a topic of the tree is none of them.
std::vector<std::string> BackupPages(const CHelpPrjTree& tree, const std::vector<std::string>& names);

} // namespace tovimar
