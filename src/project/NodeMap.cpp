#include "project/NodeMap.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <functional>
#include <utility>

namespace tovimar {

namespace {

std::uint32_t HashOf(std::string_view folded) {
    return static_cast<std::uint32_t>(std::hash<std::string_view>()(folded));
}

} // namespace

std::size_t NodeMap::SlotOf(std::string_view folded, std::uint32_t hash) const {
    const auto mask = slots_.size() - 1;
    auto at = hash & mask;
    while (slots_[at].entry != 0 && (slots_[at].hash != hash || entries_[slots_[at].entry - 1].key != folded))
        at = (at + 1) & mask;
    return at;
}

CHelpPrjTreeNode* NodeMap::Find(std::string_view key) const {
    if (count_ == 0)
        return nullptr;
    const auto folded = text::FoldCase(key);
    const auto entry = slots_[SlotOf(folded, HashOf(folded))].entry;
    return entry == 0 ? nullptr : entries_[entry - 1].node;
}

bool NodeMap::Add(CHelpPrjTreeNode* node, std::string_view key) {
    if (2 * (entries_.size() + 1) > slots_.size())
        Rebuild();
    auto folded = text::FoldCase(key);
    const auto hash = HashOf(folded);
    auto& slot = slots_[SlotOf(folded, hash)];
    if (slot.entry != 0) {
        // A key that comes back stands where it is added, not where it was.
        if (entries_[slot.entry - 1].node != nullptr)
            return false;
        entries_[slot.entry - 1].key.clear();
    }
    entries_.push_back({std::move(folded), node});
    slot = {static_cast<std::uint32_t>(entries_.size()), hash};
    ++count_;
    return true;
}

bool NodeMap::Remove(std::string_view key) {
    if (count_ == 0)
        return false;
    const auto folded = text::FoldCase(key);
    const auto entry = slots_[SlotOf(folded, HashOf(folded))].entry;
    if (entry == 0 || entries_[entry - 1].node == nullptr)
        return false;
    entries_[entry - 1].node = nullptr;
    --count_;
    return true;
}

/// Lets go what was removed and makes room for twice what is left.
void NodeMap::Rebuild() {
    std::erase_if(entries_, [](const Entry& entry) { return entry.node == nullptr; });
    std::size_t size = 64;
    while (size < 4 * (entries_.size() + 1))
        size *= 2;
    slots_.assign(size, {});
    for (std::size_t i = 0; i < entries_.size(); ++i) {
        const auto hash = HashOf(entries_[i].key);
        slots_[SlotOf(entries_[i].key, hash)] = {static_cast<std::uint32_t>(i + 1), hash};
    }
}

void NodeMap::Clear() {
    entries_.clear();
    slots_.clear();
    count_ = 0;
}

} // namespace tovimar
