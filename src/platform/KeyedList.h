#pragma once

#include "platform/Error.h"
#include "platform/text/Text.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

namespace tovimar {

/// Ordered list with optional text keys: insertion order, 1-based positions, keys compared without regard
/// to case, look-up by key in constant time. An entry added without a key has the key "".
/// T may be move-only (`std::unique_ptr`). References stay valid until the list changes.
template <typename T> class KeyedList {
public:
    struct Entry {
        std::string key;
        T item;
    };

    std::size_t Count() const { return entries_.size(); }
    bool Empty() const { return entries_.empty(); }

    void Add(T item) { entries_.push_back({std::string(), std::move(item)}); }

    /// Raises error 457 when the key is taken; an empty key counts as none.
    void Add(T item, const std::string& key) { InsertAt(entries_.size(), std::move(item), key); }

    /// Inserts before the entry at the 1-based `position` (Count() + 1 appends). Raises 457 as Add.
    void Insert(std::size_t position, T item, const std::string& key) {
        InsertAt(position - 1, std::move(item), key);
    }

    bool Contains(std::string_view key) const { return Find(key) != nullptr; }

    /// None when the key is absent.
    T* Find(std::string_view key) {
        const auto found = positions_.find(text::FoldCase(key));
        return found == positions_.end() ? nullptr : &entries_[found->second].item;
    }
    const T* Find(std::string_view key) const { return const_cast<KeyedList*>(this)->Find(key); }

    /// 1-based. Raises error 9 "Subscript out of range".
    T& At(std::size_t position) {
        if (position < 1 || position > entries_.size())
            throw RaisedError(9, "Subscript out of range", "KeyedList");
        return entries_[position - 1].item;
    }
    const T& At(std::size_t position) const { return const_cast<KeyedList*>(this)->At(position); }
    const std::string& KeyAt(std::size_t position) const { return entries_.at(position - 1).key; }

    /// 1-based position of a key, 0 when absent.
    std::size_t PositionOf(std::string_view key) const {
        const auto found = positions_.find(text::FoldCase(key));
        return found == positions_.end() ? 0 : found->second + 1;
    }

    /// Takes the entry out and gives it; none when the key is absent.
    std::optional<T> Take(std::string_view key) {
        const auto position = PositionOf(key);
        if (position == 0)
            return std::nullopt;
        return TakeAt(position);
    }
    T TakeAt(std::size_t position) {
        T item = std::move(At(position));
        entries_.erase(entries_.begin() + static_cast<std::ptrdiff_t>(position - 1));
        Reindex(position - 1);
        return item;
    }

    void Clear() {
        entries_.clear();
        positions_.clear();
    }

    auto begin() { return Iterator<typename std::vector<Entry>::iterator>{entries_.begin()}; }
    auto end() { return Iterator<typename std::vector<Entry>::iterator>{entries_.end()}; }
    auto begin() const { return Iterator<typename std::vector<Entry>::const_iterator>{entries_.begin()}; }
    auto end() const { return Iterator<typename std::vector<Entry>::const_iterator>{entries_.end()}; }

    /// The entries with their keys, in order.
    const std::vector<Entry>& Entries() const { return entries_; }

private:
    /// Iterates over the items alone, as callers mostly want.
    template <typename Base> struct Iterator {
        Base base;
        decltype(auto) operator*() const { return (base->item); }
        Iterator& operator++() {
            ++base;
            return *this;
        }
        bool operator==(const Iterator&) const = default;
    };

    void InsertAt(std::size_t index, T item, const std::string& key) {
        if (!key.empty()) {
            const auto [place, added] = positions_.try_emplace(text::FoldCase(key), index);
            if (!added)
                throw RaisedError(457, "This key is already associated with an element of this collection",
                                  "KeyedList");
        }
        entries_.insert(entries_.begin() + static_cast<std::ptrdiff_t>(index), Entry{key, std::move(item)});
        if (index + 1 < entries_.size())
            Reindex(index);
    }

    void Reindex(std::size_t from) {
        positions_.clear();
        (void)from;
        for (std::size_t i = 0; i < entries_.size(); ++i)
            if (!entries_[i].key.empty())
                positions_[text::FoldCase(entries_[i].key)] = i;
    }

    std::vector<Entry> entries_;
    std::unordered_map<std::string, std::size_t> positions_;
};

} // namespace tovimar
