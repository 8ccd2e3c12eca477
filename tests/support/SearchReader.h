#pragma once

#include <cstdint>
#include <map>
#include <set>
#include <string>
#include <string_view>
#include <vector>

/// Reads a full-text index as a help viewer does, written from the format alone.
class SearchReader {
public:
    explicit SearchReader(std::string bytes) : bytes_(std::move(bytes)) {}

    struct Hit {
        bool title = false;
        std::vector<std::uint32_t> places;
    };
    using Hits = std::map<std::uint32_t, std::vector<Hit>>; ///< by topic

    /// A folded word, looked up from the root down.
    Hits Find(std::string_view word) const;
    std::set<std::uint32_t> Topics(std::string_view word) const;
    /// The topics that hold every word of a text as somebody types it.
    std::set<std::uint32_t> Search(std::string_view text, int codePage) const;
    /// Every word of the leaves, in their order; a word of texts and titles comes twice.
    std::vector<std::string> Words() const;

    std::uint32_t Number(std::size_t offset, std::size_t size = 4) const;

private:
    struct Entry {
        std::string word;
        bool title = false;
        std::uint32_t count = 0, offset = 0, size = 0;
    };
    std::size_t FirstLeaf(std::string_view word) const;
    std::vector<Entry> Leaf(std::size_t offset) const;
    void Decode(const Entry& entry, Hits& hits) const;
    std::uint32_t Packed(std::size_t& at) const;
    void ReadWord(std::size_t& at, std::string& word) const;

    std::string bytes_;
};
