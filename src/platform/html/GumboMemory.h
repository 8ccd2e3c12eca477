#pragma once

#include <cstddef>
#include <memory>
#include <vector>

namespace tovimar {

/// Memory of one run of the parser. It goes all at once: the parser's own way of letting a tree go recurses
/// over it, as deep as a page nests.
class GumboMemory {
public:
    /// At most `limit` bytes.
    explicit GumboMemory(std::size_t limit) : left_(limit) {}

    /// The parser's allocator; `memory` is a GumboMemory. Raises kFailure1 at the limit: the parser has no
    /// answer of its own to a refusal, and all that it holds is here.
    static void* Allocate(void* memory, std::size_t size);
    static void Release(void*, void*) {}

private:
    void* Take(std::size_t size);

    std::size_t left_;
    std::vector<std::unique_ptr<std::byte[]>> blocks_;
    std::byte* free_ = nullptr;
    std::size_t freeBytes_ = 0;
};

} // namespace tovimar
