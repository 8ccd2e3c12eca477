#include "helpcompiler/LzxParser.h"

#include "helpcompiler/Lzx.h"

#include <algorithm>
#include <bit>
#include <cstddef>
#include <cstring>
#include <optional>
#include <utility>

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kShortest = 3;
constexpr std::size_t kLongest = 257;
constexpr unsigned kHashBits = 15;
constexpr unsigned kMostTries = 48;
/// A copy of this length is taken without a look for a better one behind.
constexpr std::size_t kLongEnough = 48;
constexpr std::uint16_t kNowhere = 0xFFFF;
/// A copy of three bytes from farther away takes more bits than three literals.
constexpr std::size_t kFarForThree = 2048;

struct Match {
    std::size_t length = 0;
    std::uint32_t offset = 0;
    int recent = -1; ///< which of the last three offsets it is
};

class Parser {
public:
    explicit Parser(std::string_view input) : input_(input), previous_(input.size(), kNowhere) {
        first_.fill(kNowhere);
        items_.reserve(input.size() / 4);
    }

    std::vector<LzxItem> Parse() {
        std::optional<Match> ahead; // of a match that gave way to a better one behind a literal
        for (std::size_t at = 0; at < input_.size();) {
            const Match match = ahead ? *ahead : Find(at);
            ahead.reset();
            Enter(at, 1);
            if (match.length > 0 && match.length < kLongEnough && at + 1 < input_.size())
                ahead = Find(at + 1);
            if (match.length == 0 || (ahead && Worth(*ahead) > Worth(match))) {
                items_.push_back({1, static_cast<std::uint8_t>(input_[at]), 0, 0});
                ++at;
                continue;
            }
            ahead.reset();
            Enter(at + 1, match.length - 1);
            Take(match);
            at += match.length;
        }
        return std::move(items_);
    }

private:
    static std::uint32_t Load(const char* from) {
        std::uint32_t word = 0;
        std::memcpy(&word, from, sizeof word);
        return word;
    }

    std::size_t HashAt(std::size_t at) const {
        const auto* bytes = reinterpret_cast<const unsigned char*>(input_.data() + at);
        const std::uint32_t three = bytes[0] | static_cast<std::uint32_t>(bytes[1]) << 8U |
                                    static_cast<std::uint32_t>(bytes[2]) << 16U;
        return (three * 0x9E3779B1U) >> (32 - kHashBits);
    }

    void Enter(std::size_t at, std::size_t count) {
        const std::size_t end = std::min(at + count, input_.size() - kShortest + 1);
        for (; at < end; ++at) {
            std::uint16_t& head = first_[HashAt(at)];
            previous_[at] = head;
            head = static_cast<std::uint16_t>(at);
        }
    }

    std::size_t LengthOf(std::size_t at, std::size_t from, std::size_t most) const {
        const char* left = input_.data() + at;
        const char* right = input_.data() + from;
        std::size_t length = 0;
        for (; length + 8 <= most; length += 8) {
            std::uint64_t a = 0;
            std::uint64_t b = 0;
            std::memcpy(&a, left + length, 8);
            std::memcpy(&b, right + length, 8);
            if (a != b)
                return length + static_cast<std::size_t>(std::countr_zero(a ^ b)) / 8;
        }
        while (length < most && left[length] == right[length])
            ++length;
        return length;
    }

    /// A match of a recent offset costs about as much as a byte less of another.
    static std::size_t Worth(const Match& match) { return match.length + (match.recent >= 0 ? 1 : 0); }

    Match Find(std::size_t at) const {
        const std::size_t most = std::min(kLongest, kLzxFrame - at % kLzxFrame);
        Match best = FindRecent(at, most);
        if (most < kShortest || at + kShortest > input_.size())
            return best;
        std::size_t length = best.length == 0 ? kShortest - 1 : best.length + 1;
        unsigned tries = kMostTries;
        for (std::uint16_t from = first_[HashAt(at)]; from != kNowhere && tries-- > 0;
             from = previous_[from]) {
            if (length >= most)
                break;
            if (input_[at + length] != input_[from + length])
                continue;
            const std::size_t found = LengthOf(at, from, most);
            const std::size_t offset = at - from;
            if (found <= length || (found == 3 && offset > kFarForThree))
                continue;
            best = {found, static_cast<std::uint32_t>(offset), -1};
            length = found;
        }
        return best;
    }

    Match FindRecent(std::size_t at, std::size_t most) const {
        Match best;
        for (std::size_t i = 0; i < recent_.size(); ++i) {
            if (recent_[i] > at)
                continue;
            const std::size_t length = LengthOf(at, at - recent_[i], most);
            if (length >= 2 && length > best.length)
                best = {length, recent_[i], static_cast<int>(i)};
        }
        return best;
    }

    void Take(const Match& match) {
        LzxItem item;
        item.length = static_cast<std::uint16_t>(match.length);
        const auto known = std::find(recent_.begin(), recent_.end(), match.offset);
        if (known != recent_.end()) {
            item.slot = static_cast<std::uint8_t>(known - recent_.begin());
            std::swap(recent_[0], *known);
        } else {
            const std::uint32_t shifted = match.offset + 2;
            unsigned slot = 3;
            if (shifted >= 4) {
                const auto top = static_cast<unsigned>(std::bit_width(shifted)) - 1;
                slot = 2 * top + (shifted >> (top - 1) & 1U);
            }
            item.slot = static_cast<std::uint8_t>(slot);
            item.rest = shifted - LzxSlotBase(slot);
            recent_ = {match.offset, recent_[0], recent_[1]};
        }
        items_.push_back(item);
    }

    std::string_view input_;
    std::array<std::uint16_t, 1U << kHashBits> first_;
    std::vector<std::uint16_t> previous_;
    std::array<std::uint32_t, 3> recent_{1, 1, 1};
    std::vector<LzxItem> items_;
};

} // namespace

unsigned LzxExtraBits(unsigned slot) {
    return slot < 4 ? 0 : slot / 2 - 1;
}

std::uint32_t LzxSlotBase(unsigned slot) {
    return slot < 4 ? slot : (2U + (slot & 1U)) << LzxExtraBits(slot);
}

std::vector<LzxItem> ParseInterval(std::string_view input) {
    return Parser(input).Parse();
}

} // namespace tovimar::helpcompiler
