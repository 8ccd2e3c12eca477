#include "helpcompiler/Directory.h"

#include "helpcompiler/Bytes.h"
#include "platform/text/Caseless.h"

#include <algorithm>
#include <string_view>

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kChunkSize = 0x1000;
constexpr std::size_t kLeafHead = 0x14;
constexpr std::size_t kNodeHead = 8;
constexpr std::size_t kEntriesPerMark = 5;
constexpr std::uint32_t kNone = 0xFFFFFFFFU;

/// Seven bits a byte, the most significant first, the high bit on all but the last.
void PutName(std::string& out, std::uint64_t number) {
    char digits[10];
    std::size_t count = 0;
    for (digits[count++] = static_cast<char>(number & 0x7FU); number >>= 7;)
        digits[count++] = static_cast<char>((number & 0x7FU) | 0x80U);
    while (count > 0)
        out.push_back(digits[--count]);
}

/// Letters of ASCII compare as small ones, everything else by bytes: "_" comes before them.
bool ComesBefore(const DirectoryEntry& left, const DirectoryEntry& right) {
    return std::lexicographical_compare(left.name.begin(), left.name.end(), right.name.begin(),
                                        right.name.end(), [](char a, char b) {
                                            return static_cast<unsigned char>(text::CaselessAscii(a)) <
                                                   static_cast<unsigned char>(text::CaselessAscii(b));
                                        });
}

/// A chunk in the making: entries from the front, the places of every fifth from the back.
class Chunk {
public:
    explicit Chunk(std::size_t head) : head_(head) {}

    bool Take(const std::string& entry) {
        const std::size_t marks = count_ / kEntriesPerMark;
        if (head_ + entries_.size() + entry.size() + 2 + 2 * marks > kChunkSize)
            return false;
        if (count_ > 0 && count_ % kEntriesPerMark == 0)
            marks_.push_back(static_cast<std::uint32_t>(entries_.size()));
        entries_ += entry;
        ++count_;
        return true;
    }
    bool IsEmpty() const { return count_ == 0; }

    /// `head` lacks nothing but the free room, which stands at 4.
    std::string Finish(std::string head) {
        const std::size_t free = kChunkSize - head_ - entries_.size();
        SetU32(head, 4, static_cast<std::uint32_t>(free));
        std::string chunk = head + entries_;
        chunk.resize(kChunkSize, '\0');
        std::size_t place = kChunkSize - 2;
        SetU16(chunk, place, count_);
        for (const std::uint32_t mark : marks_)
            SetU16(chunk, place -= 2, mark);
        *this = Chunk(head_);
        return chunk;
    }

private:
    std::size_t head_;
    std::string entries_;
    std::vector<std::uint32_t> marks_;
    std::uint32_t count_ = 0;
};

struct Child {
    std::string name; ///< the first below it
    std::uint32_t chunk;
};

class DirectoryWriter {
public:
    explicit DirectoryWriter(std::vector<DirectoryEntry> entries) : entries_(std::move(entries)) {
        std::stable_sort(entries_.begin(), entries_.end(), ComesBefore);
    }

    std::string Write() {
        WriteLeaves();
        const std::uint32_t lastLeaf = chunkCount_ - 1;
        std::uint32_t depth = 1;
        for (; level_.size() > 1; ++depth)
            WriteLevel();
        std::string out = "ITSP";
        for (const std::uint32_t number :
             {1U, 0x54U, 0x0AU, static_cast<std::uint32_t>(kChunkSize), 2U, depth,
              depth == 1 ? kNone : chunkCount_ - 1, 0U, lastLeaf, kNone, chunkCount_, 0x409U})
            PutU32(out, number);
        out += FromHex("6a92025d2e21d0119df900a0c922e6ec");
        for (const std::uint32_t number : {0x54U, kNone, kNone, kNone})
            PutU32(out, number);
        return out + chunks_;
    }

private:
    void WriteLeaves() {
        Chunk chunk(kLeafHead);
        std::string first;
        for (const DirectoryEntry& entry : entries_) {
            std::string bytes;
            PutName(bytes, entry.name.size());
            bytes += entry.name;
            for (const std::uint64_t number : {std::uint64_t{entry.section}, entry.offset, entry.length})
                PutName(bytes, number);
            if (!chunk.Take(bytes)) {
                FinishLeaf(chunk, first, false);
                chunk.Take(bytes);
            }
            if (first.empty())
                first = entry.name;
        }
        FinishLeaf(chunk, first, true);
    }

    void FinishLeaf(Chunk& chunk, std::string& first, bool last) {
        std::string head = "PMGL";
        PutU64(head, 0);
        PutU32(head, chunkCount_ == 0 ? kNone : chunkCount_ - 1);
        PutU32(head, last ? kNone : chunkCount_ + 1);
        chunks_ += chunk.Finish(head);
        level_.push_back({std::move(first), chunkCount_++});
        first.clear();
    }

    void WriteLevel() {
        Chunk chunk(kNodeHead);
        std::vector<Child> above;
        std::string first;
        const auto finish = [&] {
            std::string head = "PMGI";
            PutU32(head, 0);
            chunks_ += chunk.Finish(head);
            above.push_back({first, chunkCount_++});
        };
        for (const Child& child : level_) {
            std::string bytes;
            PutName(bytes, child.name.size());
            bytes += child.name;
            PutName(bytes, child.chunk);
            if (chunk.IsEmpty())
                first = child.name;
            if (!chunk.Take(bytes)) {
                finish();
                first = child.name;
                chunk.Take(bytes);
            }
        }
        finish();
        level_ = std::move(above);
    }

    std::vector<DirectoryEntry> entries_;
    std::string chunks_;
    std::uint32_t chunkCount_ = 0;
    std::vector<Child> level_;
};

} // namespace

std::string DirectoryBytes(std::vector<DirectoryEntry> entries) {
    return DirectoryWriter(std::move(entries)).Write();
}

} // namespace tovimar::helpcompiler
