#include "platform/access/SqlTokens.h"

#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kMaxTokens = 1'000'000;

bool IsWordCharacter(char character) {
    const auto byte = static_cast<unsigned char>(character);
    return byte >= 0x80 || (byte >= '0' && byte <= '9') || (byte >= 'a' && byte <= 'z') ||
           (byte >= 'A' && byte <= 'Z') || byte == '_' || byte == '$' || byte == '~';
}

bool IsBlank(char character) {
    return character == ' ' || character == '\t' || character == '\r' || character == '\n';
}

/// Text between quotes, a doubled quote is one; `position` moves behind it.
std::string TakeQuoted(std::string_view sql, std::size_t& position) {
    const char quote = sql[position++];
    std::string content;
    while (position < sql.size()) {
        const char character = sql[position++];
        if (character == quote && (position >= sql.size() || sql[position] != quote))
            return content;
        if (character == quote)
            ++position;
        content += character;
    }
    return content;
}

std::string TakeBracketed(std::string_view sql, std::size_t& position) {
    const auto close = std::min(sql.find(']', position), sql.size());
    std::string name(sql.substr(position + 1, close - position - 1));
    position = std::min(close + 1, sql.size());
    return name;
}

std::string TakeWord(std::string_view sql, std::size_t& position) {
    const auto start = position;
    while (position < sql.size() && IsWordCharacter(sql[position]))
        ++position;
    return std::string(sql.substr(start, position - start));
}

} // namespace

bool SqlToken::IsWord(std::string_view word) const {
    return kind == Kind::Word && text::EqualsIgnoringCase(text, word);
}

std::vector<SqlToken> TokenizeSql(std::string_view sql) {
    std::vector<SqlToken> tokens;
    std::size_t position = 0;
    while (position < sql.size() && tokens.size() < kMaxTokens) {
        if (IsBlank(sql[position])) {
            ++position;
            continue;
        }
        SqlToken token;
        token.begin = position;
        if (sql[position] == '[') {
            token.kind = SqlToken::Kind::Bracketed;
            token.text = TakeBracketed(sql, position);
        } else if (sql[position] == '"' || sql[position] == '\'' || sql[position] == '#') {
            token.kind = SqlToken::Kind::Text;
            token.text = TakeQuoted(sql, position);
        } else if (IsWordCharacter(sql[position])) {
            token.kind = SqlToken::Kind::Word;
            token.text = TakeWord(sql, position);
        } else {
            token.text = std::string(1, sql[position++]);
        }
        token.end = position;
        tokens.push_back(std::move(token));
    }
    return tokens;
}

} // namespace tovimar::platform::access
