#include "helpcompiler/Lzx.h"

#include "helpcompiler/Bytes.h"
#include "helpcompiler/Huffman.h"
#include "helpcompiler/LzxParser.h"

#include <algorithm>
#include <cmath>
#include <span>
#include <vector>

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kMainSymbols = 512;
constexpr std::size_t kLengthSymbols = 249;
constexpr std::size_t kAlignedSymbols = 8;
constexpr unsigned kLongestCode = 16;
constexpr unsigned kLongestPretreeCode = 15;
constexpr unsigned kLongestAlignedCode = 7;

enum class Block : unsigned { Verbatim = 1, Aligned = 2, Stored = 3 };

/// Words of sixteen bits, filled from the top.
class WordWriter {
public:
    void Put(std::uint32_t bits, unsigned count) {
        buffer_ = buffer_ << count | bits;
        for (used_ += count; used_ >= 16; used_ -= 16)
            PutU16(bytes_, static_cast<std::uint32_t>(buffer_ >> (used_ - 16) & 0xFFFFU));
    }
    void FillWord() {
        if (used_ > 0)
            Put(0, 16 - used_);
    }
    std::string& Bytes() { return bytes_; }

private:
    std::string bytes_;
    std::uint64_t buffer_ = 0;
    unsigned used_ = 0;
};

/// Symbols of one kind: counted first, written then.
struct Code {
    Code(std::size_t symbols, unsigned limit) : frequencies(symbols), longest(limit) {}

    std::vector<std::uint32_t> frequencies;
    unsigned longest;
    std::vector<std::uint8_t> lengths;
    std::vector<std::uint16_t> codes;

    void Make() {
        lengths = CodeLengths(frequencies, longest);
        codes = CanonicalCodes(lengths);
    }
    void Put(WordWriter& out, std::size_t symbol) const { out.Put(codes[symbol], lengths[symbol]); }
    std::uint64_t Bits() const {
        std::uint64_t bits = 0;
        for (std::size_t i = 0; i < lengths.size(); ++i)
            bits += std::uint64_t{frequencies[i]} * lengths[i];
        return bits;
    }
};

/// A symbol of the code in which code lengths are written, with the bits behind it.
struct LengthRun {
    unsigned symbol;
    unsigned bits = 0;
    unsigned bitCount = 0;
    int repeated = -1; ///< of runs of a length: the symbol that says which
};

/// Lengths as differences from none at all: an interval has but one block.
std::vector<LengthRun> RunsOf(std::span<const std::uint8_t> lengths) {
    std::vector<LengthRun> runs;
    for (std::size_t i = 0; i < lengths.size();) {
        std::size_t end = i;
        while (end < lengths.size() && lengths[end] == lengths[i])
            ++end;
        const auto count = static_cast<unsigned>(end - i);
        const unsigned symbol = (17U - lengths[i]) % 17;
        unsigned taken = 1;
        if (lengths[i] == 0 && count >= 20) {
            taken = std::min(count, 51U);
            runs.push_back({18, taken - 20, 5});
        } else if (lengths[i] == 0 && count >= 4) {
            taken = count;
            runs.push_back({17, taken - 4, 4});
        } else if (count >= 4) {
            taken = std::min(count, 5U);
            runs.push_back({19, taken - 4, 1, static_cast<int>(symbol)});
        } else {
            runs.push_back({symbol});
        }
        i += taken;
    }
    return runs;
}

void PutLengths(WordWriter& out, std::span<const std::uint8_t> lengths) {
    const auto runs = RunsOf(lengths);
    Code pretree(20, kLongestPretreeCode);
    for (const LengthRun& run : runs) {
        ++pretree.frequencies[run.symbol];
        if (run.repeated >= 0)
            ++pretree.frequencies[static_cast<std::size_t>(run.repeated)];
    }
    pretree.Make();
    for (const std::uint8_t length : pretree.lengths)
        out.Put(length, 4);
    for (const LengthRun& run : runs) {
        pretree.Put(out, run.symbol);
        out.Put(run.bits, run.bitCount);
        if (run.repeated >= 0)
            pretree.Put(out, static_cast<std::size_t>(run.repeated));
    }
}

std::size_t MainSymbolOf(const LzxItem& item) {
    return item.length == 1 ? item.literal : 256U + 8U * item.slot + std::min(item.length - 2U, 7U);
}

class Encoder {
public:
    explicit Encoder(std::string_view input) : input_(input), items_(ParseInterval(input)) {}

    LzxInterval Encode() {
        Count();
        main_.Make();
        length_.Make();
        aligned_.Make();
        const bool useAligned = aligned_.Bits() + 3 * kAlignedSymbols < plainAlignedBits_;
        out_.Put(0, 1); // no translation of machine code
        out_.Put(static_cast<unsigned>(useAligned ? Block::Aligned : Block::Verbatim), 3);
        out_.Put(static_cast<std::uint32_t>(input_.size()), 24);
        if (useAligned)
            for (const std::uint8_t length : aligned_.lengths)
                out_.Put(length, 3);
        const std::span<const std::uint8_t> lengths(main_.lengths);
        PutLengths(out_, lengths.first(256));
        PutLengths(out_, lengths.subspan(256));
        PutLengths(out_, length_.lengths);
        PutItems(useAligned);
        result_.bytes = std::move(out_.Bytes());
        return std::move(result_);
    }

private:
    void Count() {
        for (const LzxItem& item : items_) {
            ++main_.frequencies[MainSymbolOf(item)];
            if (item.length >= 9)
                ++length_.frequencies[item.length - 9U];
            if (LzxExtraBits(item.slot) >= 3) {
                ++aligned_.frequencies[item.rest & 7U];
                plainAlignedBits_ += 3;
            }
        }
    }

    void PutItems(bool useAligned) {
        std::size_t place = 0;
        for (const LzxItem& item : items_) {
            main_.Put(out_, MainSymbolOf(item));
            if (item.length >= 9)
                length_.Put(out_, item.length - 9U);
            const unsigned extra = LzxExtraBits(item.slot);
            if (useAligned && extra >= 3) {
                out_.Put(item.rest >> 3U, extra - 3);
                aligned_.Put(out_, item.rest & 7U);
            } else {
                out_.Put(item.rest, extra);
            }
            place += item.length;
            if (place % kLzxFrame == 0) {
                out_.FillWord();
                result_.frameEnds[result_.frames++] = static_cast<std::uint32_t>(out_.Bytes().size());
            }
        }
    }

    std::string_view input_;
    std::vector<LzxItem> items_;
    Code main_{kMainSymbols, kLongestCode};
    Code length_{kLengthSymbols, kLongestCode};
    Code aligned_{kAlignedSymbols, kLongestAlignedCode};
    std::uint64_t plainAlignedBits_ = 0;
    WordWriter out_;
    LzxInterval result_;
};

/// What doesn't shrink, such as a picture: the bytes themselves.
LzxInterval Stored(std::string_view input) {
    WordWriter out;
    out.Put(0, 1);
    out.Put(static_cast<unsigned>(Block::Stored), 3);
    out.Put(static_cast<std::uint32_t>(input.size()), 24);
    out.FillWord();
    LzxInterval result;
    result.bytes = std::move(out.Bytes());
    for (int i = 0; i < 3; ++i)
        PutU32(result.bytes, 1); // the last offsets
    const std::size_t head = result.bytes.size();
    result.bytes.reserve(head + input.size());
    result.bytes += input;
    while (result.frames * kLzxFrame < input.size()) {
        ++result.frames;
        result.frameEnds[result.frames - 1] = static_cast<std::uint32_t>(head + result.frames * kLzxFrame);
    }
    return result;
}

/// Whether the bytes are spread so evenly that each holds so many bits of its eight. Looks at one byte in
/// `step`.
bool IsDense(std::string_view input, double bitsOfByte, std::size_t step) {
    std::array<std::uint32_t, 256> counts{};
    std::size_t seen = 0;
    for (std::size_t i = 0; i < input.size(); i += step, ++seen)
        ++counts[static_cast<unsigned char>(input[i])];
    double bits = 0;
    for (const std::uint32_t count : counts)
        if (count > 0)
            bits += count * std::log2(static_cast<double>(seen) / count);
    return bits > bitsOfByte * static_cast<double>(seen);
}

/// Not worth a try: as evenly spread as pictures that are compressed already. Of what is said to be packed a
/// sample will do, but it must be as even: pictures of forms repeat themselves, and lose a third.
bool IsPacked(std::string_view input, Expect expect) {
    return expect == Expect::Packed ? IsDense(input, 7.9, 7) : IsDense(input, 7.93, 1);
}

} // namespace

LzxInterval CompressInterval(std::string_view input, Expect expect) {
    if (IsPacked(input, expect))
        return Stored(input);
    LzxInterval packed = Encoder(input).Encode();
    return packed.bytes.size() < input.size() ? packed : Stored(input);
}

} // namespace tovimar::helpcompiler
