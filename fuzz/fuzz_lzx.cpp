// Whatever is compressed comes back: a strict reader that shares no code with the compiler unpacks it.

#include "helpcompiler/Lzx.h"
#include "support/LzxReader.h"

#include <cstddef>
#include <cstdint>
#include <string>

using namespace tovimar::helpcompiler;

/// The bytes again and again, each time a little changed, up to whole frames.
static std::string Filled(const std::uint8_t* data, std::size_t size) {
    const std::size_t length = data[0] % 2 == 0 ? kLzxFrame : kLzxInterval;
    std::string input;
    for (std::size_t round = 0; input.size() < length; ++round)
        for (std::size_t i = 1; i < size && input.size() < length; ++i)
            input.push_back(static_cast<char>(data[i] ^ (i % 97 == round % 97 ? round : 0)));
    return input;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 2)
        return 0;
    const std::string input = Filled(data, size);
    if (UnpackInterval(CompressInterval(input).bytes, input.size()) != input)
        __builtin_trap();
    return 0;
}
