#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <string>
#include <string_view>

namespace tovimar::platform::access {

/// Walks over bytes of a database's storage, numbers little-endian. Reading behind the end raises
/// 0x80040001 "<what> ends too early.": the bytes are a stranger's, and every length in them may lie.
class ByteReader {
public:
    ByteReader(std::string_view bytes, const char* what) : bytes_(bytes), what_(what) {}

    std::size_t Position() const { return position_; }
    std::size_t Left() const { return bytes_.size() - position_; }
    bool AtEnd() const { return Left() == 0; }

    std::string_view Take(std::size_t count) {
        if (count > Left())
            Fail("ends too early");
        const auto taken = bytes_.substr(position_, count);
        position_ += count;
        return taken;
    }
    std::uint8_t U8() { return static_cast<std::uint8_t>(Number(1)); }
    std::uint16_t U16() { return static_cast<std::uint16_t>(Number(2)); }
    std::uint32_t U32() { return Number(4); }
    void Skip(std::size_t count) { Take(count); }
    /// Up to the next zero byte, which is taken, too.
    std::string_view ZeroTerminated() {
        const auto end = bytes_.find('\0', position_);
        if (end == std::string_view::npos)
            Fail("ends too early");
        const auto taken = Take(end - position_);
        Skip(1);
        return taken;
    }
    [[noreturn]] void Fail(const std::string& reason) const {
        throw RaisedError(kFailure1, std::string(what_) + " " + reason + ".", "DatabaseReader");
    }

private:
    std::uint32_t Number(std::size_t size) {
        const auto bytes = Take(size);
        std::uint32_t number = 0;
        for (std::size_t i = size; i-- > 0;)
            number = number << 8U | static_cast<std::uint8_t>(bytes[i]);
        return number;
    }

    std::string_view bytes_;
    const char* what_; ///< "The design" and the like, for messages
    std::size_t position_ = 0;
};

/// UTF-8 of UTF-16 bytes, low byte first, without regard to a last odd byte.
std::string FromUtf16Bytes(std::string_view bytes);

} // namespace tovimar::platform::access
