#pragma once

#include "platform/text/Text.h"

#include <cstddef>
#include <list>
#include <string>
#include <string_view>
#include <unordered_map>

namespace tovimar {

class CHelpPrjTreeNode;

/// The key map of a tree: nodes by key, without regard to case, in the order in which they were added.
/// Look-up and removal take constant time, since every remade topic takes all its controls out of the map
/// and a map of one large project holds tens of thousands of them. The nodes are not owned.
class NodeMap {
public:
    std::size_t Count() const { return nodes_.size(); }
    bool Contains(std::string_view key) const { return Find(key) != nullptr; }
    /// Null when the key is absent.
    CHelpPrjTreeNode* Find(std::string_view key) const;
    /// False, and nothing changes, when the key is taken.
    bool Add(CHelpPrjTreeNode* node, std::string_view key);
    /// False when the key is absent.
    bool Remove(std::string_view key);
    void Clear();

    /// Iterates over the nodes in the order of adding.
    auto begin() const { return nodes_.begin(); }
    auto end() const { return nodes_.end(); }

private:
    std::list<CHelpPrjTreeNode*> nodes_;
    std::unordered_map<std::string, std::list<CHelpPrjTreeNode*>::iterator> places_;
};

} // namespace tovimar
