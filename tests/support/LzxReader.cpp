#include "support/LzxReader.h"

#include <array>
#include <cstdint>
#include <map>
#include <stdexcept>
#include <utility>
#include <vector>

namespace {

constexpr std::size_t kFrame = 0x8000;

void Expect(bool right, const char* what) {
    if (!right)
        throw std::runtime_error(what);
}

class Input {
public:
    explicit Input(std::string_view bytes) : bytes_(bytes) {}

    std::uint32_t Bits(unsigned count) {
        std::uint32_t bits = 0;
        for (; count > 0; --count)
            bits = bits << 1U | Bit();
        return bits;
    }
    /// To the next word's border; a whole word when `always` and there is nothing to skip.
    void ToWord(bool always) {
        if (always && place_ % 16 == 0)
            Expect(Bits(16) == 0, "padding");
        while (place_ % 16 != 0)
            Expect(Bit() == 0, "padding");
    }
    std::string_view Bytes(std::size_t count) {
        const std::size_t start = place_ / 8;
        Expect(start + count <= bytes_.size(), "too short");
        place_ += count * 8;
        return bytes_.substr(start, count);
    }
    bool IsAtEnd() const { return place_ == bytes_.size() * 8; }

private:
    /// Words have their low byte first, and are read from the top.
    unsigned Bit() {
        const std::size_t byte = place_ / 16 * 2 + (place_ % 16 < 8 ? 1 : 0);
        Expect(byte < bytes_.size(), "too short");
        const unsigned bit = static_cast<unsigned char>(bytes_[byte]) >> (7 - place_ % 8) & 1U;
        ++place_;
        return bit;
    }

    std::string_view bytes_;
    std::size_t place_ = 0;
};

class Code {
public:
    explicit Code(const std::vector<unsigned>& lengths) {
        unsigned code = 0;
        for (unsigned length = 1; length <= 16; ++length, code <<= 1U)
            for (unsigned symbol = 0; symbol < lengths.size(); ++symbol)
                if (lengths[symbol] == length)
                    symbols_[{length, code++}] = symbol;
        Expect(symbols_.empty() || code == 1U << 17U, "a code isn't complete");
    }
    unsigned Read(Input& input) const {
        unsigned code = 0;
        for (unsigned length = 1; length <= 16; ++length) {
            code = code << 1U | input.Bits(1);
            if (const auto found = symbols_.find({length, code}); found != symbols_.end())
                return found->second;
        }
        throw std::runtime_error("no such code");
    }

private:
    std::map<std::pair<unsigned, unsigned>, unsigned> symbols_;
};

void ReadLengths(Input& input, std::vector<unsigned>& lengths, std::size_t from, std::size_t end) {
    std::vector<unsigned> own(20);
    for (unsigned& length : own)
        length = input.Bits(4);
    const Code code(own);
    while (from < end) {
        unsigned symbol = code.Read(input);
        std::size_t count = 1;
        if (symbol == 17 || symbol == 18) {
            count = symbol == 17 ? 4 + input.Bits(4) : 20 + input.Bits(5);
            symbol = 0;
        } else if (symbol == 19) {
            count = 4 + input.Bits(1);
            symbol = code.Read(input);
        }
        Expect(symbol < 17 && from + count <= end, "a run of lengths");
        for (; count > 0; --count, ++from)
            lengths[from] = (17 - symbol) % 17;
    }
}

class Unpacker {
public:
    Unpacker(std::string_view bytes, std::size_t length) : input_(bytes), length_(length) {}

    std::string Run() {
        Expect(input_.Bits(1) == 0, "translation of machine code");
        while (out_.size() < length_)
            ReadBlock();
        Expect(input_.IsAtEnd(), "bytes are left over");
        return std::move(out_);
    }

private:
    void ReadBlock() {
        const unsigned kind = input_.Bits(3);
        const std::size_t end = out_.size() + input_.Bits(24);
        Expect(end <= length_ && kind >= 1 && kind <= 3, "a block's head");
        if (kind == 3) {
            input_.ToWord(true);
            input_.Bytes(12);
            out_ += input_.Bytes(end - out_.size());
            return;
        }
        std::vector<unsigned> aligned(8);
        if (kind == 2)
            for (unsigned& length : aligned)
                length = input_.Bits(3);
        std::vector<unsigned> mainLengths(512);
        std::vector<unsigned> lengthLengths(249);
        ReadLengths(input_, mainLengths, 0, 256);
        ReadLengths(input_, mainLengths, 256, 512);
        ReadLengths(input_, lengthLengths, 0, 249);
        const Code alignedCode(kind == 2 ? aligned : std::vector<unsigned>());
        ReadItems(Code(mainLengths), Code(lengthLengths), kind == 2 ? &alignedCode : nullptr, end);
    }

    void ReadItems(const Code& mainCode, const Code& lengthCode, const Code* aligned, std::size_t end) {
        while (out_.size() < end) {
            const unsigned symbol = mainCode.Read(input_);
            if (symbol < 256) {
                out_.push_back(static_cast<char>(symbol));
            } else {
                std::size_t length = symbol % 8 + 2;
                if (length == 9)
                    length += lengthCode.Read(input_);
                Copy(length, Offset((symbol - 256) / 8, aligned));
            }
            if (out_.size() % kFrame == 0)
                input_.ToWord(false);
        }
    }

    std::size_t Offset(unsigned slot, const Code* aligned) {
        if (slot < 3) {
            std::swap(recent_[0], recent_[slot]);
            return recent_[0];
        }
        const unsigned bits = slot < 4 ? 0 : slot / 2 - 1;
        std::size_t offset = slot < 4 ? slot : (2U + slot % 2) << bits;
        if (aligned != nullptr && bits >= 3) {
            offset += std::size_t{input_.Bits(bits - 3)} << 3U;
            offset += aligned->Read(input_);
        } else {
            offset += input_.Bits(bits);
        }
        recent_ = {offset - 2, recent_[0], recent_[1]};
        return recent_[0];
    }

    void Copy(std::size_t length, std::size_t offset) {
        Expect(offset >= 1 && offset <= out_.size(), "a copy from before the interval");
        Expect(out_.size() / kFrame == (out_.size() + length - 1) / kFrame, "a copy over the end of a frame");
        for (; length > 0; --length)
            out_.push_back(out_[out_.size() - offset]);
    }

    Input input_;
    std::size_t length_;
    std::string out_;
    std::array<std::size_t, 3> recent_{1, 1, 1};
};

} // namespace

std::string UnpackInterval(std::string_view bytes, std::size_t length) {
    return Unpacker(bytes, length).Run();
}
