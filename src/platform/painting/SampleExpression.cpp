#include "platform/painting/SampleExpression.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <cctype>

namespace tovimar::platform::painting {

namespace {

/// The word of an expression at a place: a number, a date or page function, or a function that leaves its
/// argument readable. None for every other.
std::optional<std::string> WordText(const std::string& word) {
    if (!word.empty() && word.find_first_not_of("0123456789") == std::string::npos)
        return word;
    if (word == "date")
        return "3/14/2024";
    if (word == "now")
        return "3/14/2024 9:30:00 AM";
    if (word == "time")
        return "9:30:00 AM";
    if (word == "page" || word == "pages")
        return "1";
    for (const auto* transparent : {"trim", "ucase", "lcase", "nz", "str"})
        if (word == transparent)
            return std::string();
    return std::nullopt;
}

std::string_view WordAt(std::string_view expression, std::size_t at) {
    auto end = at;
    while (end < expression.size() && std::isalnum(static_cast<unsigned char>(expression[end])) != 0)
        ++end;
    return expression.substr(at, end - at);
}

/// What stands between the mark at a place and its closing one.
std::string_view Enclosed(std::string_view expression, std::size_t at, char closing) {
    const auto end = std::min(expression.find(closing, at + 1), expression.size());
    return expression.substr(at + 1, end - at - 1);
}

} // namespace

std::string FieldName(std::string_view source) {
    auto name = text::Trim(source);
    const auto point = name.rfind('.');
    if (point != std::string::npos && point + 1 < name.size())
        name = name.substr(point + 1);
    std::erase_if(name, [](char letter) { return letter == '[' || letter == ']'; });
    return name;
}

std::optional<std::string>
JoinExpression(std::string_view expression,
               const std::function<std::string(std::string_view field)>& fieldText) {
    constexpr std::string_view kBetween = "&+ ()$";
    std::string result;
    for (std::size_t at = 0; at < expression.size();) {
        const char letter = expression[at];
        if (letter == '"') {
            const auto literal = Enclosed(expression, at, '"');
            result += literal;
            at += literal.size() + 2;
        } else if (letter == '[') {
            const auto field = Enclosed(expression, at, ']');
            const auto page = WordText(text::FoldCase(field));
            result += page && !page->empty() ? *page : fieldText(field);
            at += field.size() + 2;
        } else if (kBetween.find(letter) != std::string_view::npos) {
            ++at;
        } else {
            const auto word = WordAt(expression, at);
            const auto shown = WordText(text::FoldCase(word));
            if (!shown)
                return std::nullopt;
            result += *shown;
            at += word.size();
        }
    }
    return result;
}

bool IsAggregate(std::string_view expression) {
    for (const auto* aggregate : {"Sum(", "Count(", "Avg(", "Max(", "Min("})
        if (text::ContainsIgnoringCase(expression, aggregate))
            return true;
    return false;
}

std::string LookedUpField(std::string_view expression) {
    std::size_t matched = 0;
    const auto call = text::FindIgnoringCase(expression, "DLookUp(", 0, &matched);
    if (call == std::string_view::npos)
        return {};
    const auto from = expression.find('"', call + matched);
    const auto to = from == std::string_view::npos ? from : expression.find('"', from + 1);
    return to == std::string_view::npos ? std::string()
                                        : FieldName(expression.substr(from + 1, to - from - 1));
}

std::string SpacedName(std::string_view name) {
    std::string spaced;
    for (const char letter : name) {
        const bool capital = letter >= 'A' && letter <= 'Z';
        if (capital && !spaced.empty() && spaced.back() >= 'a' && spaced.back() <= 'z')
            spaced += ' ';
        spaced += letter == '_' ? ' ' : letter;
    }
    return spaced;
}

} // namespace tovimar::platform::painting
