#pragma once

#include "platform/Error.h"

#include <cstddef>
#include <cstdint>
#include <deque>
#include <utility>

namespace tovimar {

/// A stack with a cursor that walks over its items, for a history in which one goes back and forth. Item 1 is
/// the top. On an empty stack `Pop`, `Top`, `Current`, `Up` and `Down` raise 0x80041387 "Stack is empty".
template <typename T> class cStack {
public:
    static constexpr ResultCode kEmpty = MakeResultCode(0x80041387U);
    static constexpr ResultCode kAtTop = MakeResultCode(0x80041388U);
    static constexpr ResultCode kAtBottom = MakeResultCode(0x80041389U);

    /// The cursor goes to the new item. Without `Top` what lies above the cursor is dropped first: a new page
    /// of a history leaves no way forward.
    void Push(T vData, bool Top = true) {
        if (!Top)
            for (std::int32_t above = cursor_ - 1; above > 0 && !items_.empty(); --above)
                Pop();
        items_.push_front(std::move(vData));
        cursor_ = 1;
    }
    T Pop() {
        RefuseEmpty();
        T item = std::move(items_.front());
        items_.pop_front();
        return item;
    }
    const T& Top() const { return Item(1); }
    const T& Current() const { return Item(cursor_); }
    /// Raises 0x80041388 "Already top".
    const T& Up() {
        RefuseEmpty();
        if (cursor_ <= 1)
            throw RaisedError(kAtTop, "Already top", "cStack::Up");
        return Item(--cursor_);
    }
    /// Raises 0x80041389 "Already bottom".
    const T& Down() {
        RefuseEmpty();
        if (cursor_ >= StackCount())
            throw RaisedError(kAtBottom, "Already bottom", "cStack::Down");
        return Item(++cursor_);
    }
    bool IsEmpty() const { return items_.empty(); }
    std::int32_t StackCount() const { return static_cast<std::int32_t>(items_.size()); }
    /// The cursor stays.
    void Clear() { items_.clear(); }
    std::int32_t CursorPosition() const { return cursor_; }
    /// Raises 9 "Subscript out of range".
    const T& Item(std::int32_t vindex) const {
        RefuseEmpty();
        return items_[IndexOf(vindex)];
    }
    void RemoveItem(std::int32_t vindex) {
        items_.erase(items_.begin() + static_cast<std::ptrdiff_t>(IndexOf(vindex)));
    }

private:
    void RefuseEmpty() const {
        if (items_.empty())
            throw RaisedError(kEmpty, "Stack is empty", "cStack::Pop");
    }
    std::size_t IndexOf(std::int32_t position) const {
        if (position < 1 || position > StackCount())
            throw RaisedError(9, "Subscript out of range", "cStack");
        return static_cast<std::size_t>(position) - 1;
    }

    /// The top is the first.
    std::deque<T> items_;
    std::int32_t cursor_ = 0;
};

} // namespace tovimar
