#include "editor/CStringBuilder.h"

#include "platform/Error.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar {

std::size_t CStringBuilder::Length() const {
    return text::Length(text_);
}

void CStringBuilder::Append(std::string_view text) {
    const std::size_t needed = text_.size() + text.size();
    // Twice as much at least: a long page would be copied once for every chunk.
    if (needed > text_.capacity())
        text_.reserve(std::max(needed + ChunkSize, text_.capacity() * 2));
    text_.append(text);
}

std::size_t CStringBuilder::OffsetOf(std::size_t index) const {
    if (index == 0)
        throw RaisedError(9, "Subscript out of range", "CStringBuilder");
    std::size_t offset = 0;
    while (--index > 0 && offset < text_.size())
        text::NextCodePoint(text_, offset);
    return offset;
}

void CStringBuilder::Insert(std::size_t index, std::string_view text) {
    text_.insert(OffsetOf(index), text);
}

void CStringBuilder::Remove(std::size_t index, std::size_t length) {
    const std::size_t begin = OffsetOf(index);
    std::size_t end = begin;
    for (; length > 0 && end < text_.size(); --length)
        text::NextCodePoint(text_, end);
    text_.erase(begin, end - begin);
}

std::size_t CStringBuilder::Find(std::string_view text, std::size_t from) const {
    const std::size_t found = text_.find(text, OffsetOf(from));
    return found == std::string::npos ? 0 : text::Length(std::string_view(text_).substr(0, found)) + 1;
}

} // namespace tovimar
