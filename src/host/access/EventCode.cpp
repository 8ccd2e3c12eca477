#include "host/access/EventCode.h"

#include "platform/text/Text.h"

namespace tovimar {
namespace {

constexpr auto kNone = std::string_view::npos;

bool BeginsWith(std::string_view code, std::string_view word) {
    return text::StartsWithIgnoringCase(code, word);
}

bool IsIdentifier(std::string_view text) {
    for (const char c : text)
        if (static_cast<unsigned char>(c) < 128 && c != '_' && (c < '0' || c > '9') && (c < 'A' || c > 'Z') &&
            (c < 'a' || c > 'z'))
            return false;
    return !text.empty();
}

/// The next word of what is left, which loses it.
std::string_view TakeWord(std::string_view& rest) {
    rest.remove_prefix(std::min(rest.find_first_not_of(" \t"), rest.size()));
    const std::string_view word = rest.substr(0, rest.find_first_of(" \t="));
    rest.remove_prefix(word.size());
    return word;
}

/// "Call DoCmd.OpenForm(\"Orders\")" as "DoCmd.OpenForm \"Orders\"".
std::string WithoutCall(std::string_view statement) {
    if (!BeginsWith(statement, "Call "))
        return std::string(statement);
    std::string call = text::TrimWhitespace(statement.substr(5));
    if (const auto open = call.find('('); open != std::string::npos && call.back() == ')') {
        call.pop_back();
        call[open] = ' ';
    }
    return call;
}

/// Takes a line apart into statements.
class LineReader {
public:
    explicit LineReader(std::vector<std::string>& statements) : statements_(statements) {}

    void Take(std::string_view line) {
        for (std::size_t start = 0; start < line.size();) {
            const auto end = EndOfStatement(line, start);
            const std::string statement = text::TrimWhitespace(line.substr(start, end - start));
            const bool comment = BeginsWith(statement, "Rem ") || (end < line.size() && line[end] == '\'');
            if (!BeginsWith(statement, "Rem "))
                TakeBranches(statement);
            if (comment)
                return;
            start = end + 1;
        }
    }

private:
    /// At a colon that isn't part of a named argument, or at a comment.
    static std::size_t EndOfStatement(std::string_view line, std::size_t start) {
        bool quoted = false;
        for (auto i = start; i < line.size(); ++i) {
            if (line[i] == '"')
                quoted = !quoted;
            else if (!quoted && (line[i] == '\'' || (line[i] == ':' && line.substr(i, 2) != ":=")))
                return i;
        }
        return line.size();
    }

    void TakeBranches(std::string_view statement) {
        if (BeginsWith(statement, "If ") || BeginsWith(statement, "ElseIf ")) {
            const auto then = FindOutsideQuotes(statement, " Then");
            statement.remove_prefix(then == kNone ? statement.size() : then + 5);
        } else if (BeginsWith(statement, "Else ")) {
            statement.remove_prefix(5);
        }
        for (auto next = kNone; !statement.empty(); statement.remove_prefix(next + 6)) {
            next = FindOutsideQuotes(statement, " Else ");
            const std::string branch = WithoutCall(text::TrimWhitespace(statement.substr(0, next)));
            if (!branch.empty())
                statements_.push_back(branch);
            if (next == kNone)
                return;
        }
    }

    std::vector<std::string>& statements_;
};

} // namespace

std::size_t FindOutsideQuotes(std::string_view code, std::string_view sought, std::size_t from) {
    bool quoted = false;
    for (std::size_t i = from; i < code.size(); ++i) {
        if (code[i] == '"')
            quoted = !quoted;
        if (!quoted && text::EqualsIgnoringCase(code.substr(i, sought.size()), sought))
            return i;
    }
    return kNone;
}

std::vector<std::string> EventStatements(std::string_view code) {
    std::vector<std::string> statements;
    LineReader reader(statements);
    std::string kept;
    for (const std::string& piece : text::Split(code, "\n")) {
        std::string line = text::TrimWhitespace(piece);
        if (line.empty())
            continue;
        const bool goesOn = line.back() == '_';
        if (goesOn)
            line.pop_back();
        kept += (kept.empty() ? "" : " ") + line;
        if (goesOn)
            continue;
        reader.Take(kept);
        kept.clear();
    }
    return statements;
}

void TextNames::Take(std::string_view statement) {
    std::string_view rest = statement;
    std::string_view name = TakeWord(rest);
    for (const std::string_view word : {"Private", "Public", "Const"})
        if (text::EqualsIgnoringCase(name, word))
            name = TakeWord(rest);
    if (std::string_view behind = rest; text::EqualsIgnoringCase(TakeWord(behind), "As")) {
        TakeWord(behind);
        rest = behind;
    }
    const std::string value = text::TrimWhitespace(rest);
    if (!IsIdentifier(name) || !value.starts_with('='))
        return;
    const std::string quoted = text::TrimWhitespace(std::string_view(value).substr(1));
    if (quoted.size() >= 2 && quoted.front() == '"' && quoted.find('"', 1) == quoted.size() - 1)
        texts_[text::FoldCase(name)] = quoted.substr(1, quoted.size() - 2);
}

const std::string* TextNames::Find(std::string_view name) const {
    const auto found = texts_.find(text::FoldCase(name));
    return found == texts_.end() ? nullptr : &found->second;
}

} // namespace tovimar
