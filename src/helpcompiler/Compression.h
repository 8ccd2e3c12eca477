#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar::helpcompiler {

/// Everything that is compressed, joined, with the places that readers jump to.
struct CompressedContent {
    std::string bytes;
    std::vector<std::uint64_t> frames; ///< where each frame begins
    std::uint64_t length = 0;          ///< uncompressed
};

/// Takes files one by one and compresses on all processors; the bytes don't depend on their number.
class Compressor {
public:
    /// 0 threads: as many as there are processors.
    explicit Compressor(unsigned threads = 0);
    /// Where the bytes lie in the uncompressed content.
    std::uint64_t Add(std::string_view bytes);
    CompressedContent Finish();

private:
    void CompressPending(bool all);

    unsigned threads_;
    std::string pending_;
    CompressedContent content_;
};

} // namespace tovimar::helpcompiler
