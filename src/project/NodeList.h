#pragma once

#include <cstddef>
#include <memory>
#include <string_view>
#include <vector>

namespace tovimar {

class CHelpPrjTreeNode;

/// The children of a node, owned, in the order of the topics. Positions count from 1. A child is found by the
/// key that it has at that moment, by a walk: whoever needs a node by its key asks the tree's key map, which
/// also sees to it that no key stands twice.
class NodeList {
public:
    using Item = std::unique_ptr<CHelpPrjTreeNode>;

    NodeList();
    ~NodeList();
    NodeList(NodeList&&) noexcept;
    NodeList& operator=(NodeList&&) noexcept;

    std::size_t Count() const { return items_.size(); }
    bool Empty() const { return items_.empty(); }
    /// Raises error 9 "Subscript out of range".
    const Item& At(std::size_t position) const;
    auto begin() const { return items_.begin(); }
    auto end() const { return items_.end(); }
    auto begin() { return items_.begin(); }
    auto end() { return items_.end(); }

    /// 0 when no child has the key.
    std::size_t PositionOf(std::string_view key) const;
    /// 0 when the node is none of the children.
    std::size_t PositionOf(const CHelpPrjTreeNode& node) const;
    bool Contains(std::string_view key) const { return PositionOf(key) != 0; }

    void Add(Item item);
    /// Before the child at `position`; Count() + 1 appends.
    void Insert(std::size_t position, Item item);
    Item TakeAt(std::size_t position);

private:
    std::vector<Item> items_;
};

} // namespace tovimar
