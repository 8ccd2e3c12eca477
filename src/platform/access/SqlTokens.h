#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

/// Words of the host's SQL dialect.
namespace tovimar::platform::access {

struct SqlToken {
    enum class Kind { Word, Bracketed, Text, Symbol };
    Kind kind = Kind::Symbol;
    std::string text;      ///< a bracketed name without its brackets, a text without its quotes
    std::size_t begin = 0; ///< bytes in the statement
    std::size_t end = 0;

    bool IsWord(std::string_view word) const; ///< a bare word, ignoring case
    bool IsSymbol(char symbol) const { return kind == Kind::Symbol && text.size() == 1 && text[0] == symbol; }
    bool IsName() const { return kind == Kind::Word || kind == Kind::Bracketed; }
};

/// An open quote or bracket runs to the end of the statement. At most a million tokens are given.
std::vector<SqlToken> TokenizeSql(std::string_view sql);

} // namespace tovimar::platform::access
