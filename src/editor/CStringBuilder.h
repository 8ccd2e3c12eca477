#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace tovimar {

/// A text that grows by chunks, so that adding to it doesn't copy the whole each time. Lengths and positions
/// count characters; positions begin at 1.
class CStringBuilder {
public:
    /// Characters by which the buffer grows at least.
    std::size_t ChunkSize = 16384;

    std::size_t Length() const;
    /// Bytes that fit without growing.
    std::size_t Capacity() const { return text_.capacity(); }
    std::string ToString() const { return text_; }
    const std::string& TheString() const { return text_; }
    void SetTheString(const std::string& text) { text_ = text; }

    void Append(std::string_view text);
    void AppendByVal(std::string_view text) { Append(text); }
    /// Before the character at `index`; at the end behind the last. Raises 9 for position 0.
    void Insert(std::size_t index, std::string_view text);
    void InsertByVal(std::size_t index, std::string_view text) { Insert(index, text); }
    /// As many characters as there are from `index`. Raises 9 for position 0.
    void Remove(std::size_t index, std::size_t length);
    /// Position of the first occurrence at or behind `from`, 0 when there is none. Case counts.
    std::size_t Find(std::string_view text, std::size_t from = 1) const;
    /// Gives memory back that the text doesn't need.
    void HeapMinimize() { text_.shrink_to_fit(); }

    /// Makes room without changing the text.
    void Reserve(std::size_t bytes) { text_.reserve(bytes); }
    /// Takes bytes off the end.
    void Truncate(std::size_t bytes) { text_.resize(text_.size() - bytes); }

private:
    std::size_t OffsetOf(std::size_t index) const;

    std::string text_;
};

} // namespace tovimar
