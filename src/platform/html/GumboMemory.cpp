#include "platform/html/GumboMemory.h"

#include "platform/Error.h"

namespace tovimar {

namespace {

constexpr std::size_t kBlock = 64 * 1024;

} // namespace

void* GumboMemory::Allocate(void* memory, std::size_t size) {
    return static_cast<GumboMemory*>(memory)->Take(size);
}

void* GumboMemory::Take(std::size_t size) {
    constexpr std::size_t kAlignment = alignof(std::max_align_t);
    size = (size + kAlignment - 1) / kAlignment * kAlignment;
    if (size > left_)
        throw RaisedError(kFailure1, "The page is too large to be read", "HtmlDocument");
    left_ -= size;
    if (size > kBlock / 4) {
        blocks_.push_back(std::make_unique_for_overwrite<std::byte[]>(size));
        return blocks_.back().get();
    }
    if (size > freeBytes_) {
        blocks_.push_back(std::make_unique_for_overwrite<std::byte[]>(kBlock));
        free_ = blocks_.back().get();
        freeBytes_ = kBlock;
    }
    std::byte* taken = free_;
    free_ += size;
    freeBytes_ -= size;
    return taken;
}

} // namespace tovimar
