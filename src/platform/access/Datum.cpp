#include "platform/access/Datum.h"

#include "platform/text/Text.h"

#include <charconv>
#include <chrono>
#include <cmath>
#include <cstdio>

namespace tovimar::platform::access {

namespace {

using std::chrono::sys_days;

constexpr sys_days kFirstDay{std::chrono::year{1899} / 12 / 30};
constexpr double kSecondsOfDay = 86400;

std::optional<double> ParseNumber(std::string_view text) {
    double number = 0;
    const auto* end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, number);
    const bool whole = result.ec == std::errc() && result.ptr == end && std::isfinite(number);
    return whole ? std::optional<double>(number) : std::nullopt;
}

/// "9:30:05 PM", "21:30", as a part of a day; none when there is no time.
std::optional<double> ParseTime(const std::string& text) {
    int hour = 0, minute = 0, second = 0;
    if (std::sscanf(text.c_str(), "%d:%d:%d", &hour, &minute, &second) < 2)
        return std::nullopt;
    if (text::ContainsIgnoringCase(text, "PM") && hour < 12)
        hour += 12;
    if (text::ContainsIgnoringCase(text, "AM") && hour == 12)
        hour = 0;
    if (hour < 0 || hour > 23 || minute < 0 || minute > 59 || second < 0 || second > 60)
        return std::nullopt;
    return (hour * 3600 + minute * 60 + second) / kSecondsOfDay;
}

/// The shortest digits that give the number again, at most fifteen as the host shows.
std::string NumberText(double number) {
    char buffer[40];
    std::snprintf(buffer, sizeof(buffer), "%.15g", number);
    return buffer;
}

} // namespace

std::optional<double> Datum::AsNumber() const {
    switch (kind) {
    case Kind::Null:
        return std::nullopt;
    case Kind::Text:
        return ParseNumber(text::Trim(text));
    default:
        return number;
    }
}

std::string Datum::AsText() const {
    switch (kind) {
    case Kind::Null:
        return {};
    case Kind::Text:
        return text;
    case Kind::Boolean:
        return number != 0 ? "True" : "False";
    case Kind::Date:
        return FormatDatum(*this, "General Date");
    case Kind::Number:
        break;
    }
    return NumberText(number);
}

bool Datum::IsTrue() const {
    if (kind == Kind::Text)
        return text::EqualsIgnoringCase(text, "True") || text::EqualsIgnoringCase(text, "Yes") ||
               AsNumber().value_or(0) != 0;
    return kind != Kind::Null && number != 0;
}

std::optional<int> Compare(const Datum& left, const Datum& right) {
    if (left.IsNull() || right.IsNull())
        return std::nullopt;
    const bool texts = left.kind == Datum::Kind::Text && right.kind == Datum::Kind::Text;
    const auto a = texts ? std::nullopt : left.AsNumber(), b = texts ? std::nullopt : right.AsNumber();
    if (a && b)
        return *a < *b ? -1 : *a > *b ? 1 : 0;
    if (texts)
        return text::CompareIgnoringCase(left.text, right.text);
    const auto order = text::FoldCase(left.AsText()).compare(text::FoldCase(right.AsText()));
    return order < 0 ? -1 : order > 0 ? 1 : 0;
}

std::optional<double> ParseDate(std::string_view source) {
    const std::string text(source);
    int first = 0, second = 0, third = 0, read = 0;
    int year = 1899, month = 12, day = 30;
    if (std::sscanf(text.c_str(), "%d-%d-%d%n", &first, &second, &third, &read) == 3)
        year = first, month = second, day = third;
    else if (std::sscanf(text.c_str(), "%d/%d/%d%n", &first, &second, &third, &read) == 3)
        year = third, month = first, day = second;
    else
        read = -1;
    const auto time =
        ParseTime(read < 0 ? text : text.substr(std::min(text.size(), static_cast<std::size_t>(read) + 1)));
    if (read < 0 && !time)
        return std::nullopt;
    const auto unsignedPart = [](int part) { return static_cast<unsigned>(std::max(0, part)); };
    const std::chrono::year_month_day date{std::chrono::year{year}, std::chrono::month{unsignedPart(month)},
                                           std::chrono::day{unsignedPart(day)}};
    if (!date.ok() || year < 100 || year > 9999)
        return std::nullopt;
    return static_cast<double>((sys_days{date} - kFirstDay).count()) + time.value_or(0);
}

Datum DatumOf(const std::string& cell, Records::Type type) {
    if (cell.empty())
        return {};
    if (type == Records::Type::Boolean)
        return Datum::Boolean(Datum::Text(cell).IsTrue());
    if (type == Records::Type::Number || type == Records::Type::Currency)
        if (const auto number = ParseNumber(cell))
            return Datum::Number(*number);
    if (type == Records::Type::DateTime)
        if (const auto days = ParseDate(cell))
            return Datum::Date(*days);
    return Datum::Text(cell);
}

std::string ReadableCell(const std::string& cell, Records::Type type) {
    switch (type) {
    case Records::Type::Boolean:
        return Datum::Text(cell).IsTrue() ? "True" : "False";
    case Records::Type::DateTime:
        return DatumOf(cell, type).AsText();
    case Records::Type::Currency:
        return cell.ends_with("00") && cell.find('.') != std::string::npos ? cell.substr(0, cell.size() - 2)
                                                                           : cell;
    case Records::Type::Binary:
        return {};
    default:
        return cell;
    }
}

} // namespace tovimar::platform::access
