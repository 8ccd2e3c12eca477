#include "project/NodeMap.h"

namespace tovimar {

CHelpPrjTreeNode* NodeMap::Find(std::string_view key) const {
    const auto found = places_.find(text::FoldCase(key));
    return found == places_.end() ? nullptr : *found->second;
}

bool NodeMap::Add(CHelpPrjTreeNode* node, std::string_view key) {
    const auto [place, added] = places_.try_emplace(text::FoldCase(key));
    if (added)
        place->second = nodes_.insert(nodes_.end(), node);
    return added;
}

bool NodeMap::Remove(std::string_view key) {
    const auto found = places_.find(text::FoldCase(key));
    if (found == places_.end())
        return false;
    nodes_.erase(found->second);
    places_.erase(found);
    return true;
}

void NodeMap::Clear() {
    places_.clear();
    nodes_.clear();
}

} // namespace tovimar
