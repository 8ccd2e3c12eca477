#pragma once

namespace tovimar::platform::access {

/// Value of a hexadecimal digit, -1 for any other character.
constexpr int HexDigit(char digit) {
    if (digit >= '0' && digit <= '9')
        return digit - '0';
    const char lower = static_cast<char>(digit | 0x20);
    return lower >= 'a' && lower <= 'f' ? lower - 'a' + 10 : -1;
}

} // namespace tovimar::platform::access
