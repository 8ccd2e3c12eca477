#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace tovimar::helpcompiler {

/// A name of the container and where its bytes are.
struct DirectoryEntry {
    std::string name; ///< UTF-8
    std::uint32_t section = 0;
    std::uint64_t offset = 0;
    std::uint64_t length = 0;
};

/// Names that are longer have no place in a chunk of the directory.
constexpr std::size_t kLongestName = 1024;

/// The container's directory with its header: chunks of sorted entries, and above them chunks that lead
/// there.
std::string DirectoryBytes(std::vector<DirectoryEntry> entries);

} // namespace tovimar::helpcompiler
