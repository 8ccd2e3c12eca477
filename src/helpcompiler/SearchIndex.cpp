#include "helpcompiler/SearchIndex.h"

#include "helpcompiler/Bytes.h"

#include <algorithm>
#include <array>
#include <bit>
#include <numeric>
#include <span>

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kHeaderSize = 0x400;
constexpr std::size_t kNodeSize = 4096;
constexpr std::size_t kLeafHead = 8;
constexpr std::size_t kIndexHead = 2;

/// How often numbers of so many bits occur, to choose the code that makes them shortest.
class BitCounts {
public:
    void Add(std::uint32_t number) { ++counts_[static_cast<std::size_t>(std::bit_width(number))]; }

    /// Bits that are stored plainly in the shortest form; at least one.
    unsigned Cheapest() const {
        unsigned best = 1;
        for (unsigned root = 2; root < 32; ++root)
            if (Cost(root) < Cost(best))
                best = root;
        return best;
    }

private:
    std::uint64_t Cost(unsigned root) const {
        std::uint64_t cost = 0;
        for (unsigned bits = 0; bits < counts_.size(); ++bits)
            cost += counts_[bits] * (bits <= root ? 1 + root : 2 * bits - root);
        return cost;
    }

    std::array<std::uint64_t, 33> counts_{};
};

/// Bits from the top of each byte.
class BitWriter {
public:
    explicit BitWriter(std::string& out) : out_(out) {}

    void Put(std::uint32_t number, unsigned root) {
        const auto bits = static_cast<unsigned>(std::bit_width(number));
        if (bits <= root) {
            PutBits(number, root + 1);
            return;
        }
        for (unsigned i = root; i < bits; ++i)
            PutBits(1, 1);
        PutBits(0, 1);
        PutBits(number & ((1U << (bits - 1)) - 1), bits - 1);
    }

    void FillByte() {
        if (count_ > 0)
            PutBits(0, 8 - count_);
    }

private:
    void PutBits(std::uint32_t bits, unsigned count) {
        while (count-- > 0) {
            byte_ = byte_ << 1U | (bits >> count & 1U);
            if (++count_ == 8) {
                out_.push_back(static_cast<char>(byte_ & 0xFFU));
                count_ = 0;
            }
        }
    }

    std::string& out_;
    unsigned byte_ = 0;
    unsigned count_ = 0;
};

/// A word as nodes store it: what it shares with the word before it is left out.
std::string PackedWord(std::string_view word, std::string_view previous) {
    const auto ends = std::mismatch(word.begin(), word.end(), previous.begin(), previous.end());
    const auto shared = static_cast<std::size_t>(ends.first - word.begin());
    std::string out;
    out.push_back(static_cast<char>(word.size() - shared + 1));
    out.push_back(static_cast<char>(shared));
    out.append(word.substr(shared));
    return out;
}

struct Child {
    std::string_view lastWord;
    std::uint32_t offset;
};

} // namespace

std::uint32_t SearchIndex::NumberOf(std::string_view word) {
    if (const auto known = numbers_.find(word); known != numbers_.end())
        return known->second;
    const auto number = static_cast<std::uint32_t>(words_.size());
    words_.push_back(&numbers_.emplace(word, number).first->first);
    return number;
}

void SearchIndex::Add(std::uint32_t topic, const PageWords& words) {
    if (words.text.empty())
        return;
    pages_.push_back({topic, tokens_.size()});
    std::uint32_t place = 0;
    std::uint32_t position = 0;
    for (std::size_t from = 0; from < words.text.size(); ++position) {
        const std::size_t end = words.text.find('\0', from);
        const auto word = std::string_view(words.text).substr(from, end - from);
        from = end + 1;
        if (!stopWords_.empty() && stopWords_.contains(std::string(word)))
            continue;
        tokens_.push_back({NumberOf(word) * 2 + (position < words.titleWords ? 1 : 0), place});
        highestPlace_ = std::max(highestPlace_, place++);
    }
    mostCharacters_ = std::max(mostCharacters_, words.characters);
}

/// Lays the index out: leaves with the places of their words before them, then the nodes above.
class SearchIndexWriter {
public:
    SearchIndexWriter(const SearchIndex& index, int codePage, std::uint32_t language)
        : index_(index), codePage_(codePage), language_(language) {}

    std::string Write() {
        Gather();
        ChooseCodes();
        out_.assign(kHeaderSize, '\0');
        WriteLeaves();
        WriteLevels();
        WriteHeader();
        return std::move(out_);
    }

private:
    struct Occurrence {
        std::uint32_t topic;
        std::uint32_t place;
    };
    /// A word in texts, or in titles.
    struct Entry {
        std::string_view word;
        bool title;
        std::span<const Occurrence> occurrences;
    };

    /// Sorts the tokens by word; those of a word stay in the order of pages and places.
    void Gather() {
        std::vector<std::size_t> ends(index_.words_.size() * 2 + 1);
        for (const auto& token : index_.tokens_)
            ++ends[token.entry + 1];
        std::partial_sum(ends.begin(), ends.end(), ends.begin());
        const std::vector<std::size_t> starts(ends);
        occurrences_.resize(index_.tokens_.size());
        for (std::size_t page = 0; page < index_.pages_.size(); ++page)
            for (std::size_t i = index_.pages_[page].firstToken; i < EndOfPage(page); ++i)
                occurrences_[ends[index_.tokens_[i].entry]++] = {index_.pages_[page].topic,
                                                                 index_.tokens_[i].place};
        for (std::size_t i = 0; i + 1 < starts.size(); ++i)
            if (const std::size_t count = starts[i + 1] - starts[i]; count > 0)
                entries_.push_back(
                    {*index_.words_[i / 2], i % 2 == 1, std::span(occurrences_).subspan(starts[i], count)});
        std::sort(entries_.begin(), entries_.end(), [](const Entry& left, const Entry& right) {
            return left.word == right.word ? left.title < right.title : left.word < right.word;
        });
    }

    std::size_t EndOfPage(std::size_t page) const {
        return page + 1 < index_.pages_.size() ? index_.pages_[page + 1].firstToken : index_.tokens_.size();
    }

    /// Calls `put` with each number of an entry's places and the number's kind; `endOfPage` after each page.
    template <typename Put, typename End>
    static std::uint32_t Encode(const Entry& entry, Put put, End endOfPage) {
        std::uint32_t pages = 0;
        std::uint32_t lastTopic = 0;
        for (std::size_t i = 0; i < entry.occurrences.size(); ++pages) {
            const std::uint32_t topic = entry.occurrences[i].topic;
            std::size_t end = i;
            while (end < entry.occurrences.size() && entry.occurrences[end].topic == topic)
                ++end;
            put(topic - lastTopic, 0);
            put(static_cast<std::uint32_t>(end - i), 1);
            for (std::uint32_t last = 0; i < end; last = entry.occurrences[i++].place)
                put(entry.occurrences[i].place - last, 2);
            lastTopic = topic;
            endOfPage();
        }
        return pages;
    }

    void ChooseCodes() {
        std::array<BitCounts, 3> counts;
        for (const Entry& entry : entries_)
            Encode(
                entry, [&](std::uint32_t number, std::size_t kind) { counts[kind].Add(number); }, [] {});
        for (std::size_t i = 0; i < counts.size(); ++i)
            roots_[i] = counts[i].Cheapest();
    }

    void WriteLeaves() {
        for (std::size_t i = 0; i < entries_.size(); ++i) {
            // Both entries of a word go into one leaf: some viewers look no further than the first leaf.
            const bool pair = i + 1 < entries_.size() && entries_[i + 1].word == entries_[i].word;
            std::string places;
            std::string both = EntryBytes(entries_[i], leafWord_, places);
            if (pair)
                both += EntryBytes(entries_[i + 1], entries_[i].word, places);
            if (kLeafHead + leaf_.size() + both.size() > kNodeSize) {
                FinishLeaf(false);
                places.clear();
                both = EntryBytes(entries_[i], {}, places);
                if (pair)
                    both += EntryBytes(entries_[i + 1], entries_[i].word, places);
            }
            leaf_ += both;
            out_ += places;
            leafWord_ = entries_[i].word;
            i += pair ? 1 : 0;
        }
        FinishLeaf(true);
    }

    /// The entry as it would stand behind `previous`; its places are appended to `places`, which is to follow
    /// what is written.
    std::string EntryBytes(const Entry& entry, std::string_view previous, std::string& places) const {
        const std::size_t start = places.size();
        BitWriter bits(places);
        const std::uint32_t pages = Encode(
            entry, [&](std::uint32_t number, std::size_t kind) { bits.Put(number, roots_[kind]); },
            [&] { bits.FillByte(); });
        std::string out = PackedWord(entry.word, previous);
        out.push_back(entry.title ? '\1' : '\0');
        PutPacked(out, pages);
        PutU32(out, static_cast<std::uint32_t>(out_.size() + start));
        PutU16(out, 0);
        PutPacked(out, places.size() - start);
        return out;
    }

    void FinishLeaf(bool last) {
        const auto offset = static_cast<std::uint32_t>(out_.size());
        const std::size_t free = kNodeSize - kLeafHead - leaf_.size();
        if (!children_.empty())
            SetU32(out_, children_.back().offset, offset);
        PutU32(out_, 0);
        PutU16(out_, 0);
        PutU16(out_, static_cast<std::uint32_t>(free));
        out_ += leaf_;
        out_.append(free, '\0');
        unused_ += free;
        leaf_.clear();
        children_.push_back({last ? entries_.back().word : leafWord_, offset});
        leafWord_ = {};
    }

    void WriteLevels() {
        leaves_ = children_.size();
        for (; children_.size() > 1; ++depth_) {
            std::vector<Child> level;
            std::string node;
            std::string_view previous;
            for (std::size_t i = 0; i < children_.size(); ++i) {
                std::string packed = IndexEntry(children_[i], previous);
                if (kIndexHead + node.size() + packed.size() > kNodeSize) {
                    level.push_back({previous, WriteIndexNode(node)});
                    packed = IndexEntry(children_[i], {});
                }
                node += packed;
                previous = children_[i].lastWord;
            }
            level.push_back({previous, WriteIndexNode(node)});
            children_ = std::move(level);
        }
    }

    static std::string IndexEntry(const Child& child, std::string_view previous) {
        std::string out = PackedWord(child.lastWord, previous);
        PutU32(out, child.offset);
        PutU16(out, 0);
        return out;
    }

    std::uint32_t WriteIndexNode(std::string& node) {
        const auto offset = static_cast<std::uint32_t>(out_.size());
        const std::size_t free = kNodeSize - kIndexHead - node.size();
        PutU16(out_, static_cast<std::uint32_t>(free));
        out_ += node;
        out_.append(free, '\0');
        unused_ += free;
        node.clear();
        return offset;
    }

    void WriteHeader() {
        std::uint64_t allLengths = 0;
        std::uint64_t entryLengths = 0;
        std::size_t longest = 0;
        for (const Entry& entry : entries_) {
            allLengths += entry.word.size() * entry.occurrences.size();
            entryLengths += entry.word.size();
            longest = std::max(longest, entry.word.size());
        }
        SetU32(out_, 0x00, 0x00280000);
        SetU32(out_, 0x04, static_cast<std::uint32_t>(index_.pages_.size()));
        SetU32(out_, 0x08, children_.front().offset);
        SetU32(out_, 0x10, static_cast<std::uint32_t>(leaves_));
        SetU32(out_, 0x14, children_.front().offset);
        SetU16(out_, 0x18, depth_);
        SetU16(out_, 0x1A, 7);
        for (std::size_t i = 0; i < roots_.size(); ++i) {
            out_[0x1E + 2 * i] = 2;
            out_[0x1F + 2 * i] = static_cast<char>(roots_[i]);
        }
        SetU32(out_, 0x2E, kNodeSize);
        SetU32(out_, 0x32, 1);
        SetU32(out_, 0x36, index_.highestPlace_);
        SetU32(out_, 0x3A, index_.mostCharacters_);
        SetU32(out_, 0x3E, static_cast<std::uint32_t>(longest));
        SetU32(out_, 0x42, static_cast<std::uint32_t>(index_.tokens_.size()));
        SetU32(out_, 0x46, static_cast<std::uint32_t>(index_.words_.size()));
        SetU32(out_, 0x4A, static_cast<std::uint32_t>(allLengths));
        SetU32(out_, 0x52, static_cast<std::uint32_t>(entryLengths));
        SetU32(out_, 0x56, static_cast<std::uint32_t>(unused_));
        SetU32(out_, 0x5E, index_.pages_.back().topic);
        SetU32(out_, 0x7A, static_cast<std::uint32_t>(codePage_));
        SetU32(out_, 0x7E, language_);
    }

    const SearchIndex& index_;
    int codePage_;
    std::uint32_t language_;
    std::vector<Occurrence> occurrences_;
    std::vector<Entry> entries_;
    std::array<unsigned, 3> roots_{};
    std::string out_;
    std::string leaf_;
    std::string_view leafWord_; ///< last word of the leaf in the making
    std::vector<Child> children_;
    std::size_t leaves_ = 0;
    std::uint32_t depth_ = 1;
    std::size_t unused_ = 0;
};

std::string SearchIndex::Bytes(int codePage, std::uint32_t language) const {
    return IsEmpty() ? std::string() : SearchIndexWriter(*this, codePage, language).Write();
}

} // namespace tovimar::helpcompiler
