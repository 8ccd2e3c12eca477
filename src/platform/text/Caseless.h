#pragma once

#include <algorithm>
#include <cstddef>
#include <string_view>

/// Keys of hash tables that ignore the case of ASCII letters: names of members, properties and kinds, which
/// have no others. A look-up takes a view and makes no text of its own, which counts where every property of
/// every control is looked up by name.
namespace tovimar::text {

inline char CaselessAscii(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c + 32) : c;
}

struct CaselessHash {
    using is_transparent = void;
    std::size_t operator()(std::string_view name) const {
        std::size_t hash = 14695981039346656037ULL; // FNV-1a
        for (const char c : name)
            hash = (hash ^ static_cast<unsigned char>(CaselessAscii(c))) * 1099511628211ULL;
        return hash;
    }
};

struct CaselessEqual {
    using is_transparent = void;
    bool operator()(std::string_view left, std::string_view right) const {
        return left.size() == right.size() &&
               std::equal(left.begin(), left.end(), right.begin(),
                          [](char a, char b) { return CaselessAscii(a) == CaselessAscii(b); });
    }
};

} // namespace tovimar::text
