#include "support/SearchReader.h"

#include "helpcompiler/WordTable.h"

#include <algorithm>
#include <stdexcept>

namespace {

class Bits {
public:
    explicit Bits(std::string_view bytes) : bytes_(bytes) {}
    std::uint32_t Take(unsigned count) {
        std::uint32_t number = 0;
        for (; count > 0; --count, ++place_)
            number =
                number << 1 | (static_cast<unsigned char>(bytes_.at(place_ / 8)) >> (7 - place_ % 8) & 1U);
        return number;
    }
    /// Leading ones tell how many bits more than `root` the number has.
    std::uint32_t Number(unsigned root) {
        unsigned ones = 0;
        while (Take(1) == 1)
            ++ones;
        return ones == 0 ? Take(root) : 1U << (root + ones - 1) | Take(root + ones - 1);
    }
    void ToByte() { place_ = (place_ + 7) / 8 * 8; }

private:
    std::string_view bytes_;
    std::size_t place_ = 0;
};

} // namespace

std::uint32_t SearchReader::Number(std::size_t offset, std::size_t size) const {
    std::uint32_t number = 0;
    for (std::size_t i = size; i-- > 0;)
        number = number << 8 | static_cast<unsigned char>(bytes_.at(offset + i));
    return number;
}

std::uint32_t SearchReader::Packed(std::size_t& at) const {
    std::uint32_t number = 0;
    for (unsigned shift = 0;; shift += 7) {
        const auto byte = static_cast<unsigned char>(bytes_.at(at++));
        number |= (byte & 0x7FU) << shift;
        if (byte < 0x80)
            return number;
    }
}

void SearchReader::ReadWord(std::size_t& at, std::string& word) const {
    const std::uint32_t length = Number(at, 1) - 1;
    word.resize(Number(at + 1, 1));
    word += bytes_.substr(at + 2, length);
    at += 2 + length;
}

std::size_t SearchReader::FirstLeaf(std::string_view word) const {
    std::size_t node = Number(0x14);
    for (std::uint32_t depth = Number(0x18, 2); depth > 1; --depth) {
        const std::size_t end = node + 4096 - Number(node, 2);
        std::size_t at = node + 2;
        std::string last;
        std::size_t child = 0;
        while (at < end && (child == 0 || last < word)) {
            ReadWord(at, last);
            child = Number(at);
            at += 6;
        }
        node = child;
    }
    return node;
}

std::vector<SearchReader::Entry> SearchReader::Leaf(std::size_t offset) const {
    const std::size_t end = offset + 4096 - Number(offset + 6, 2);
    std::vector<Entry> entries;
    Entry entry;
    for (std::size_t at = offset + 8; at < end;) {
        ReadWord(at, entry.word);
        entry.title = Number(at++, 1) == 1;
        entry.count = Packed(at);
        entry.offset = Number(at);
        at += 6;
        entry.size = Packed(at);
        entries.push_back(entry);
    }
    return entries;
}

void SearchReader::Decode(const Entry& entry, Hits& hits) const {
    Bits bits(std::string_view(bytes_).substr(entry.offset, entry.size));
    std::uint32_t topic = 0;
    for (std::uint32_t i = 0; i < entry.count; ++i) {
        topic += bits.Number(Number(0x1F, 1));
        Hit hit{entry.title, {}};
        std::uint32_t place = 0;
        for (std::uint32_t count = bits.Number(Number(0x21, 1)); count > 0; --count)
            hit.places.push_back(place += bits.Number(Number(0x23, 1)));
        hits[topic].push_back(std::move(hit));
        bits.ToByte();
    }
}

SearchReader::Hits SearchReader::Find(std::string_view word) const {
    Hits hits;
    if (bytes_.empty())
        return hits;
    for (std::size_t leaf = FirstLeaf(word); leaf != 0; leaf = Number(leaf)) {
        const auto entries = Leaf(leaf);
        for (const Entry& entry : entries)
            if (entry.word == word)
                Decode(entry, hits);
        if (entries.empty() || entries.back().word > word)
            break;
    }
    return hits;
}

std::set<std::uint32_t> SearchReader::Topics(std::string_view word) const {
    std::set<std::uint32_t> topics;
    for (const auto& [topic, hits] : Find(word))
        topics.insert(topic);
    return topics;
}

std::set<std::uint32_t> SearchReader::Search(std::string_view text, int codePage) const {
    std::vector<std::set<std::uint32_t>> found;
    tovimar::helpcompiler::SplitWords(text, codePage,
                                      [&](std::string_view word) { found.push_back(Topics(word)); });
    if (found.empty())
        return {};
    std::set<std::uint32_t> all = found.front();
    for (const auto& topics : found)
        std::erase_if(all, [&](std::uint32_t topic) { return !topics.contains(topic); });
    return all;
}

std::vector<std::string> SearchReader::Words() const {
    std::vector<std::string> words;
    for (std::size_t leaf = bytes_.empty() ? 0 : FirstLeaf({}); leaf != 0; leaf = Number(leaf))
        for (const Entry& entry : Leaf(leaf))
            words.push_back(entry.word);
    return words;
}
