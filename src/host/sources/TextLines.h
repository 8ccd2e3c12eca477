#pragma once

#include <string_view>

namespace tovimar {

/// One line of a text after the other, without the white space at both ends, without copying the text.
class TextLines {
public:
    explicit TextLines(std::string_view text) : rest_(text) {}

    /// False at the end.
    bool Next(std::string_view& line) {
        return NextIf(line, [](std::string_view) { return true; });
    }

    /// The next line if it is one that `wanted` takes.
    template <typename Test> bool NextIf(std::string_view& line, Test wanted) {
        if (rest_.empty())
            return false;
        const auto end = rest_.find('\n');
        const std::string_view next = Trimmed(rest_.substr(0, end));
        if (!wanted(next))
            return false;
        line = next;
        rest_ = end == std::string_view::npos ? std::string_view() : rest_.substr(end + 1);
        return true;
    }

private:
    static std::string_view Trimmed(std::string_view line) {
        constexpr std::string_view kWhite = " \t\r";
        const auto first = line.find_first_not_of(kWhite);
        if (first == std::string_view::npos)
            return {};
        return line.substr(first, line.find_last_not_of(kWhite) - first + 1);
    }

    std::string_view rest_;
};

} // namespace tovimar
