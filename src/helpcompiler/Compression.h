#pragma once

#include "helpcompiler/Spool.h"

#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar::helpcompiler {

/// Everything that is compressed, joined, with the places that readers jump to.
struct CompressedContent {
    Spool bytes;
    std::vector<std::uint64_t> frames; ///< where each frame begins
    std::uint64_t length = 0;          ///< uncompressed
};

/// Takes files one by one and compresses on all processors; the bytes don't depend on their number.
class Compressor {
public:
    /// 0 threads: as many as there are processors.
    /// What is compressed is kept in `scratch` when it gets large (see Spool).
    explicit Compressor(unsigned threads = 0, const std::filesystem::path& scratch = {});
    /// Where the bytes lie in the uncompressed content.
    std::uint64_t Add(std::string_view bytes);
    /// What comes in between is compressed already, as pictures are: stored, where a glance confirms it.
    void BeginPacked() { packedFrom_ = content_.length; }
    void EndPacked() { packedTo_ = content_.length; }
    CompressedContent Finish();

private:
    void CompressPending(bool all);

    unsigned threads_;
    std::string pending_;
    std::uint64_t begin_ = 0; ///< of the pending bytes in the content
    std::uint64_t packedFrom_ = std::numeric_limits<std::uint64_t>::max();
    std::uint64_t packedTo_ = std::numeric_limits<std::uint64_t>::max();
    CompressedContent content_;
};

} // namespace tovimar::helpcompiler
