#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <unordered_map>

namespace tovimar::helpcompiler {

/// Viewers read the tables of texts in pages of this size, so no text may stand across the end of one.
constexpr std::size_t kTablePage = 4096;

/// Fills the rest of a page when `length` bytes more would cross its end.
inline void StartPageFor(std::string& table, std::size_t length) {
    const std::size_t left = kTablePage - table.size() % kTablePage;
    if (length > left && left < kTablePage)
        table.append(left, '\0');
}

/// The stream `#STRINGS`: texts that other streams point to. Equal texts stand once.
class StringTable {
public:
    /// The text's offset; 0, which is an empty text, for an empty one. Texts end at a NUL.
    std::uint32_t Add(const std::string& text);
    const std::string& Bytes() const { return bytes_; }

private:
    std::string bytes_ = std::string(1, '\0');
    std::unordered_map<std::string, std::uint32_t> offsets_;
};

} // namespace tovimar::helpcompiler
