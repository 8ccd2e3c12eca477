#include "helpcompiler/Lzx.h"
#include "helpcompiler/Huffman.h"
#include "helpcompiler/LzxParser.h"
#include "support/LzxReader.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>

using namespace tovimar::helpcompiler;

namespace {

std::string Random(std::size_t size, unsigned values, unsigned seed) {
    std::minstd_rand random(seed);
    std::string bytes;
    while (bytes.size() < size)
        bytes.push_back(static_cast<char>((random() >> 7U) % values));
    return bytes;
}

/// Repeats of earlier bytes at offsets and of lengths from everywhere.
std::string Copies(std::size_t size, unsigned seed) {
    std::minstd_rand random(seed);
    std::string bytes = Random(100, 256, seed);
    while (bytes.size() < size) {
        const std::size_t offset = random() % bytes.size() + 1;
        for (std::size_t length = random() % (random() % 8 == 0 ? 600 : 12) + 1; length > 0; --length)
            bytes.push_back(bytes[bytes.size() - offset]);
        if (random() % 3 == 0)
            bytes += Random(random() % 4, 256, static_cast<unsigned>(bytes.size()));
    }
    bytes.resize(size);
    return bytes;
}

void ExpectRoundTrip(const std::string& input) {
    const LzxInterval interval = CompressInterval(input);
    EXPECT_EQ(interval.frames, input.size() / kLzxFrame);
    EXPECT_EQ(interval.frameEnds[interval.frames - 1], interval.bytes.size());
    ASSERT_TRUE(UnpackInterval(interval.bytes, input.size()) == input);
}

double KraftSum(const std::vector<std::uint8_t>& lengths) {
    double sum = 0;
    for (const std::uint8_t length : lengths)
        sum += length == 0 ? 0 : 1.0 / static_cast<double>(1ULL << length);
    return sum;
}

} // namespace

TEST(LzxTest, UnpacksToWhatWentIn) {
    for (const std::size_t size : {kLzxFrame, kLzxInterval}) {
        for (const unsigned values : {1U, 2U, 3U, 20U, 200U, 250U, 256U})
            ExpectRoundTrip(Random(size, values, values));
        for (unsigned seed = 1; seed < 40; ++seed)
            ExpectRoundTrip(Copies(size, seed));
    }
}

TEST(LzxTest, StoresWhatDoesNotShrink) {
    const std::string dense = Random(kLzxInterval, 256, 5);
    const LzxInterval interval = CompressInterval(dense);
    EXPECT_EQ(interval.bytes.size(), dense.size() + 16);
    EXPECT_EQ(interval.frameEnds[0], kLzxFrame + 16);
    EXPECT_LT(CompressInterval(std::string(kLzxInterval, 'x')).bytes.size(), 700U);
    EXPECT_EQ(CompressInterval(dense, Expect::Packed).bytes, interval.bytes);
    // Pictures of forms aren't as dense as their name promises.
    const std::string picture = Random(kLzxInterval / 2, 180, 5);
    EXPECT_LT(CompressInterval(picture + picture, Expect::Packed).bytes.size(), kLzxInterval * 95 / 100);
}

TEST(LzxTest, CopiesEndWithTheirFrame) {
    const auto items = ParseInterval(std::string(kLzxInterval, 'a'));
    std::size_t place = 0;
    for (const LzxItem& item : items) {
        EXPECT_EQ(place / kLzxFrame, (place + item.length - 1) / kLzxFrame);
        place += item.length;
    }
    EXPECT_EQ(place, kLzxInterval);
    EXPECT_LT(items.size(), 270U);
}

TEST(HuffmanTest, CodesAreCompleteAndNoneIsTooLong) {
    const std::vector<std::uint32_t> even{5, 5, 5, 5};
    EXPECT_EQ(CodeLengths(even, 16), (std::vector<std::uint8_t>{2, 2, 2, 2}));
    EXPECT_EQ(CanonicalCodes(CodeLengths(even, 16)), (std::vector<std::uint16_t>{0, 1, 2, 3}));
    std::vector<std::uint32_t> steep{1, 1};
    while (steep.size() < 30)
        steep.push_back(steep[steep.size() - 1] + steep[steep.size() - 2]);
    for (const unsigned limit : {7U, 15U, 16U}) {
        const auto lengths = CodeLengths(steep, limit);
        EXPECT_LE(*std::max_element(lengths.begin(), lengths.end()), limit);
        EXPECT_DOUBLE_EQ(KraftSum(lengths), 1.0);
        EXPECT_LE(lengths.back(), lengths.front());
    }
    EXPECT_EQ(CodeLengths(std::vector<std::uint32_t>{0, 0, 9}, 16), (std::vector<std::uint8_t>{1, 0, 1}));
    EXPECT_EQ(CodeLengths(std::vector<std::uint32_t>{9, 0}, 16), (std::vector<std::uint8_t>{1, 1}));
    EXPECT_EQ(CodeLengths(std::vector<std::uint32_t>{0, 0}, 16), (std::vector<std::uint8_t>{0, 0}));
}
