#include "helpcompiler/Huffman.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace tovimar::helpcompiler {
namespace {

struct Weighted {
    std::uint32_t weight;
    std::uint32_t symbol;
};

/// Depths of the leaves of the tree over sorted weights; the two-queue method, linear.
unsigned Depths(const std::vector<Weighted>& leaves, std::vector<std::uint8_t>& depths) {
    const std::size_t count = leaves.size();
    std::vector<std::uint64_t> weights(2 * count - 1);
    std::vector<std::size_t> parents(2 * count - 1);
    for (std::size_t i = 0; i < count; ++i)
        weights[i] = leaves[i].weight;
    std::size_t leaf = 0;
    std::size_t inner = count;
    for (std::size_t next = count; next < 2 * count - 1; ++next)
        for (int child = 0; child < 2; ++child) {
            const bool takeLeaf = leaf < count && (inner >= next || weights[leaf] <= weights[inner]);
            const std::size_t taken = takeLeaf ? leaf++ : inner++;
            weights[next] += weights[taken];
            parents[taken] = next;
        }
    std::vector<unsigned> all(2 * count - 1);
    unsigned deepest = 0;
    for (std::size_t i = 2 * count - 2; i-- > 0;)
        deepest = std::max(deepest, all[i] = all[parents[i]] + 1);
    for (std::size_t i = 0; i < count; ++i)
        depths[leaves[i].symbol] = static_cast<std::uint8_t>(all[i]);
    return deepest;
}

} // namespace

std::vector<std::uint8_t> CodeLengths(std::span<const std::uint32_t> frequencies, unsigned longest) {
    std::vector<Weighted> leaves;
    for (std::uint32_t symbol = 0; symbol < frequencies.size(); ++symbol)
        if (frequencies[symbol] > 0)
            leaves.push_back({frequencies[symbol], symbol});
    std::vector<std::uint8_t> lengths(frequencies.size());
    if (leaves.empty())
        return lengths;
    if (leaves.size() == 1) {
        lengths[leaves[0].symbol] = 1;
        lengths[leaves[0].symbol == 0 ? 1 : 0] = 1;
        return lengths;
    }
    std::sort(leaves.begin(), leaves.end(), [](const Weighted& left, const Weighted& right) {
        return left.weight != right.weight ? left.weight < right.weight : left.symbol < right.symbol;
    });
    // Flatter weights make a flatter tree; the order of the weights stays.
    while (Depths(leaves, lengths) > longest)
        for (Weighted& leaf : leaves)
            leaf.weight = leaf.weight / 2 + 1;
    return lengths;
}

std::vector<std::uint16_t> CanonicalCodes(std::span<const std::uint8_t> lengths) {
    std::array<std::uint32_t, 18> next{};
    for (const std::uint8_t length : lengths)
        ++next[length + 1U];
    next[1] = 0;
    for (std::size_t length = 1; length < next.size(); ++length)
        next[length] = (next[length] + next[length - 1]) << 1;
    std::vector<std::uint16_t> codes(lengths.size());
    for (std::size_t symbol = 0; symbol < lengths.size(); ++symbol)
        if (lengths[symbol] > 0)
            codes[symbol] = static_cast<std::uint16_t>(next[lengths[symbol]]++);
    return codes;
}

} // namespace tovimar::helpcompiler
