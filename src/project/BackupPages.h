#pragma once

#include <set>
#include <string>
#include <vector>

namespace tovimar {

class CHelpPrjTree;

/// Those of a folder's `pages` (file names) that are backups of others there: "a_20001017.htm" and
/// "a_200010171.htm" beside "a.htm" (see BackupFileName), shown by no node of the tree. They are the writer's
/// to keep, and no part of the help: neither compiled nor searched.
std::set<std::string> BackupPages(const CHelpPrjTree& tree, const std::vector<std::string>& pages);

} // namespace tovimar
