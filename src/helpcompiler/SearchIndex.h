#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>
#include <utility>
#include <vector>

namespace tovimar::helpcompiler {

/// The words of one page in the order of its text, those of the title first, each ended by a NUL.
struct PageWords {
    std::string text;
    std::uint32_t titleWords = 0;
    std::uint32_t characters = 0; ///< bytes of visible text
    void Add(std::string_view word) { text.append(word).push_back('\0'); }
};

/// The full-text index: for every word the pages that hold it and the places in them. It takes pages one by
/// one and keeps eight bytes per word of text.
class SearchIndex {
public:
    /// Words, folded, that are left out and take no place. Given before the first page.
    void SetStopWords(std::unordered_set<std::string> words) { stopWords_ = std::move(words); }
    /// Pages come in the order of their topic numbers.
    void Add(std::uint32_t topic, const PageWords& words);
    bool IsEmpty() const { return tokens_.empty(); }
    /// The bytes of the stream `$FIftiMain`; none for an index without words.
    std::string Bytes(int codePage, std::uint32_t language) const;

private:
    struct Token {
        std::uint32_t entry; ///< number of the word times two, plus one in a title
        std::uint32_t place;
    };
    struct Page {
        std::uint32_t topic;
        std::size_t firstToken;
    };
    struct Hash {
        using is_transparent = void;
        std::size_t operator()(std::string_view text) const { return std::hash<std::string_view>{}(text); }
    };
    friend class SearchIndexWriter;

    std::uint32_t NumberOf(std::string_view word);

    std::unordered_map<std::string, std::uint32_t, Hash, std::equal_to<>> numbers_;
    std::unordered_set<std::string> stopWords_;
    std::vector<const std::string*> words_; ///< by number; keys of the map, which stay where they are
    std::vector<Token> tokens_;
    std::vector<Page> pages_;
    std::uint32_t highestPlace_ = 0;
    std::uint32_t mostCharacters_ = 0;
};

} // namespace tovimar::helpcompiler
