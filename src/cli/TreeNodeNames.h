#pragma once

#include <cstddef>
#include <string>

namespace tovimar {
class CHelpPrjTree;
class CHelpPrjTreeNode;
} // namespace tovimar

namespace tovimar::cli {

/// A node of the contents as a person names it.
///
/// Its number says where it stands: "2.1" is the first entry below the second one, "0" the project itself.
/// Entries that are left out count; controls have no number. A number is good until an entry before it moves.
std::string NodeNumber(const CHelpPrjTreeNode& node);
/// Of the child at that place, counted from 1, below a node of that number.
std::string ChildNumber(const std::string& parentNumber, std::size_t place);
/// False for what the contents don't count: placeholders and controls.
bool HasNumber(const CHelpPrjTreeNode& node);

/// By number, page ("Orders.htm", "Orders.htm#Orders_Total"), path of titles ("Forms/Orders"; one title alone
/// may stand anywhere), or key. Raises `Stop` when there is none, or several.
CHelpPrjTreeNode& FindNode(const CHelpPrjTree& tree, const std::string& typed);

} // namespace tovimar::cli
