#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

class CHelpPrjTreeNode;

/// The key map of a tree: nodes by key, without regard to case, in the order in which they were added.
/// Look-up and removal take constant time, since every remade topic takes all its controls out of the map
/// and a map of one large project holds tens of thousands of them. The nodes are not owned.
class NodeMap {
    struct Entry {
        std::string key;                  ///< folded
        CHelpPrjTreeNode* node = nullptr; ///< null for one that was removed
    };

public:
    std::size_t Count() const { return count_; }
    bool Contains(std::string_view key) const { return Find(key) != nullptr; }
    /// Null when the key is absent.
    CHelpPrjTreeNode* Find(std::string_view key) const;
    /// False, and nothing changes, when the key is taken.
    bool Add(CHelpPrjTreeNode* node, std::string_view key);
    /// False when the key is absent.
    bool Remove(std::string_view key);
    void Clear();

    /// Iterates over the nodes in the order of adding.
    class Iterator {
    public:
        Iterator(const Entry* at, const Entry* end) : at_(at), end_(end) { Skip(); }
        CHelpPrjTreeNode* operator*() const { return at_->node; }
        Iterator& operator++() {
            ++at_;
            Skip();
            return *this;
        }
        bool operator==(const Iterator& other) const { return at_ == other.at_; }

    private:
        void Skip() {
            while (at_ != end_ && at_->node == nullptr)
                ++at_;
        }
        const Entry* at_;
        const Entry* end_;
    };
    Iterator begin() const { return {entries_.data(), entries_.data() + entries_.size()}; }
    Iterator end() const {
        const auto* last = entries_.data() + entries_.size();
        return {last, last};
    }

private:
    /// Where an entry stands in `entries_`, counted from 1, and a part of its hash; 0 for a free slot.
    struct Slot {
        std::uint32_t entry = 0;
        std::uint32_t hash = 0;
    };

    /// The slot of a folded key, or the free one where it belongs.
    std::size_t SlotOf(std::string_view folded, std::uint32_t hash) const;
    void Rebuild();

    std::vector<Entry> entries_;
    /// Open addressing, the size a power of two, at most half of it in use.
    std::vector<Slot> slots_;
    std::size_t count_ = 0;
};

} // namespace tovimar
