#include "helpcompiler/Compression.h"

#include "helpcompiler/Lzx.h"
#include "helpcompiler/Threads.h"

#include <algorithm>
#include <cstddef>

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kBatch = 64 * kLzxInterval;

} // namespace

Compressor::Compressor(unsigned threads, const std::filesystem::path& scratch)
    : threads_(ThreadCount(threads)), content_{Spool(scratch), {}, 0} {}

std::uint64_t Compressor::Add(std::string_view bytes) {
    const std::uint64_t offset = content_.length;
    content_.length += bytes.size();
    while (!bytes.empty()) {
        const std::size_t count = std::min(bytes.size(), kBatch - pending_.size());
        pending_ += bytes.substr(0, count);
        bytes.remove_prefix(count);
        if (pending_.size() == kBatch)
            CompressPending(false);
    }
    return offset;
}

CompressedContent Compressor::Finish() {
    // Readers that check the padding of the last frame trip over these two lengths.
    const std::uint64_t left = content_.length % kLzxFrame;
    if (left == 0 || left == kLzxFrame - 1)
        Add(std::string_view("\0\0", 2));
    CompressPending(true);
    return std::move(content_);
}

void Compressor::CompressPending(bool all) {
    if (all)
        pending_.resize((pending_.size() + kLzxFrame - 1) / kLzxFrame * kLzxFrame, '\0');
    const std::size_t count = (pending_.size() + kLzxInterval - 1) / kLzxInterval;
    std::vector<LzxInterval> intervals(count);
    ForAll(count, threads_, [&](std::size_t i) {
        const auto bytes = std::string_view(pending_).substr(i * kLzxInterval, kLzxInterval);
        const std::uint64_t begin = begin_ + i * kLzxInterval;
        const bool packed = begin >= packedFrom_ && begin + bytes.size() <= packedTo_;
        intervals[i] = CompressInterval(bytes, packed ? Expect::Packed : Expect::Anything);
    });
    for (const LzxInterval& interval : intervals) {
        for (std::size_t frame = 0; frame < interval.frames; ++frame)
            content_.frames.push_back(content_.bytes.Size() +
                                      (frame == 0 ? 0 : interval.frameEnds[frame - 1]));
        content_.bytes.Add(interval.bytes);
    }
    begin_ += pending_.size();
    pending_.clear();
}

} // namespace tovimar::helpcompiler
