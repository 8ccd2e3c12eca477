#include "project/NodeList.h"

#include "platform/Error.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTreeNode.h"

#include <algorithm>

namespace tovimar {

NodeList::NodeList() = default;
NodeList::~NodeList() = default;
NodeList::NodeList(NodeList&&) noexcept = default;
NodeList& NodeList::operator=(NodeList&&) noexcept = default;

const NodeList::Item& NodeList::At(std::size_t position) const {
    if (position < 1 || position > items_.size())
        throw RaisedError(9, "Subscript out of range", "NodeList");
    return items_[position - 1];
}

std::size_t NodeList::PositionOf(std::string_view key) const {
    const auto found = std::find_if(items_.begin(), items_.end(), [&](const Item& item) {
        return text::EqualsIgnoringCase(item->Key(), key);
    });
    return found == items_.end() ? 0 : static_cast<std::size_t>(found - items_.begin()) + 1;
}

std::size_t NodeList::PositionOf(const CHelpPrjTreeNode& node) const {
    const auto found =
        std::find_if(items_.begin(), items_.end(), [&](const Item& item) { return item.get() == &node; });
    return found == items_.end() ? 0 : static_cast<std::size_t>(found - items_.begin()) + 1;
}

void NodeList::Add(Item item) {
    items_.push_back(std::move(item));
}

void NodeList::Insert(std::size_t position, Item item) {
    items_.insert(items_.begin() + static_cast<std::ptrdiff_t>(position - 1), std::move(item));
}

NodeList::Item NodeList::TakeAt(std::size_t position) {
    auto taken = std::move(items_.at(position - 1));
    items_.erase(items_.begin() + static_cast<std::ptrdiff_t>(position - 1));
    return taken;
}

} // namespace tovimar
