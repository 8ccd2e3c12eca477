#include "platform/access/Datum.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <cmath>
#include <cstdio>

/// The host's formats, in the spelling of its default country.
namespace tovimar::platform::access {

namespace {

constexpr std::array<const char*, 12> kMonths{"January",   "February", "March",    "April",
                                              "May",       "June",     "July",     "August",
                                              "September", "October",  "November", "December"};
constexpr std::array<const char*, 7> kDays{"Sunday",   "Monday", "Tuesday", "Wednesday",
                                           "Thursday", "Friday", "Saturday"};

struct Moment {
    int year = 1899, month = 12, day = 30, weekday = 6;
    int hour = 0, minute = 0, second = 0;
    bool timeOnly = false, midnight = true;
};

Moment MomentOf(double days) {
    Moment moment;
    if (!(std::fabs(days) < 3'000'000))
        return moment;
    const double whole = std::floor(days);
    auto seconds = static_cast<int>(std::lround((days - whole) * 86400));
    const std::chrono::sys_days date{std::chrono::sys_days{std::chrono::year{1899} / 12 / 30} +
                                     std::chrono::days{static_cast<int>(whole) + seconds / 86400}};
    seconds %= 86400;
    const std::chrono::year_month_day parts{date};
    moment.year = static_cast<int>(parts.year());
    moment.month = static_cast<int>(static_cast<unsigned>(parts.month()));
    moment.day = static_cast<int>(static_cast<unsigned>(parts.day()));
    moment.weekday = static_cast<int>(std::chrono::weekday{date}.c_encoding());
    moment.hour = seconds / 3600;
    moment.minute = seconds / 60 % 60;
    moment.second = seconds % 60;
    moment.midnight = seconds == 0;
    moment.timeOnly = whole == 0 && seconds != 0;
    return moment;
}

std::string Padded(int number, std::size_t digits) {
    auto text = std::to_string(number);
    return text.size() < digits ? std::string(digits - text.size(), '0') + text : text;
}

/// The part of a moment that a run of one letter in a format asks for.
std::string MomentPart(char letter, std::size_t count, const Moment& moment, bool twelve) {
    const int hour = twelve ? (moment.hour + 11) % 12 + 1 : moment.hour;
    switch (letter) {
    case 'd':
        if (count <= 2)
            return Padded(moment.day, count);
        return std::string(kDays[static_cast<std::size_t>(moment.weekday)]).substr(0, count == 3 ? 3 : 20);
    case 'm':
        if (count <= 2)
            return Padded(moment.month, count);
        return std::string(kMonths[static_cast<std::size_t>(moment.month - 1)])
            .substr(0, count == 3 ? 3 : 20);
    case 'y':
        return count > 2 ? std::to_string(moment.year) : Padded(moment.year % 100, 2);
    case 'h':
        return Padded(hour, std::min<std::size_t>(count, 2));
    case 'n':
        return Padded(moment.minute, std::min<std::size_t>(count, 2));
    case 's':
        return Padded(moment.second, std::min<std::size_t>(count, 2));
    default:
        return {};
    }
}

/// "AM/PM", "am/pm", "ampm" at a place of a format; 0 when there is none.
std::size_t HalfDayMark(std::string_view format, std::size_t at) {
    for (const auto* mark : {"am/pm", "ampm", "a/p"})
        if (text::StartsWithIgnoringCase(format.substr(at), mark))
            return std::string_view(mark).size();
    return 0;
}

std::string CustomDate(const Moment& moment, std::string_view format) {
    bool twelve = false;
    for (std::size_t at = 0; at < format.size(); ++at)
        twelve = twelve || HalfDayMark(format, at) > 0;
    std::string result;
    bool afterHour = false;
    for (std::size_t at = 0; at < format.size();) {
        if (const auto mark = HalfDayMark(format, at)) {
            const bool capital = format[at] == 'A' || mark == 4;
            result += moment.hour < 12 ? (capital ? "AM" : "am") : (capital ? "PM" : "pm");
            at += mark;
            continue;
        }
        const char letter = static_cast<char>(format[at] | 0x20);
        if (format[at] == '"' || format[at] == '\\') {
            const auto end = format[at] == '"' ? std::min(format.find('"', at + 1), format.size()) : at + 2;
            result += format.substr(at + 1, end - at - 1);
            at = end + (format[at] == '"' ? 1 : 0);
        } else if (std::string_view("dmyhns").find(letter) != std::string_view::npos) {
            auto end = at;
            while (end < format.size() && static_cast<char>(format[end] | 0x20) == letter)
                ++end;
            // "m" behind hours means minutes.
            result += MomentPart(letter == 'm' && afterHour ? 'n' : letter, end - at, moment, twelve);
            afterHour = letter == 'h';
            at = end;
        } else {
            result += format[at++];
        }
    }
    return result;
}

std::string DateText(double days, std::string_view format) {
    struct Named {
        const char *name, *pattern;
    };
    constexpr std::array<Named, 6> kNamed{{{"Short Date", "m/d/yyyy"},
                                           {"Medium Date", "dd-mmm-yy"},
                                           {"Long Date", "dddd, mmmm d, yyyy"},
                                           {"Short Time", "hh:nn"},
                                           {"Medium Time", "hh:nn AM/PM"},
                                           {"Long Time", "h:nn:ss AM/PM"}}};
    const auto moment = MomentOf(days);
    for (const auto& named : kNamed)
        if (text::EqualsIgnoringCase(format, named.name))
            return CustomDate(moment, named.pattern);
    if (!format.empty() && !text::EqualsIgnoringCase(format, "General Date"))
        return CustomDate(moment, format);
    if (moment.timeOnly)
        return CustomDate(moment, "h:nn:ss AM/PM");
    return CustomDate(moment, moment.midnight ? "m/d/yyyy" : "m/d/yyyy h:nn:ss AM/PM");
}

/// "1234567.5" with decimals and, if asked for, separators.
std::string Digits(double value, int decimals, bool separators) {
    std::array<char, 400> buffer{};
    std::snprintf(buffer.data(), buffer.size(), "%.*f", decimals, std::fabs(value));
    std::string digits(buffer.data());
    auto whole = std::min(digits.find('.'), digits.size());
    if (separators)
        for (; whole > 3; whole -= 3)
            digits.insert(whole - 3, ",");
    return digits;
}

/// A format's own text without quotes, and without the colours in brackets.
std::string Unquoted(std::string_view part) {
    std::string result;
    for (std::size_t at = 0; at < part.size(); ++at) {
        if (part[at] == '[')
            at = std::min(part.find(']', at), part.size());
        else if (part[at] != '"' && part[at] != '\\' && part[at] != '_')
            result += part[at];
    }
    return result;
}

/// "#,##0.00" with texts before and behind it, for values above and below 0 and for 0 itself.
std::string CustomNumber(double value, std::string_view format) {
    const auto sections = text::Split(format, ";");
    std::size_t section = value < 0 && sections.size() > 1 ? 1 : value == 0 && sections.size() > 2 ? 2 : 0;
    if (sections[section].empty())
        section = 0;
    const std::string& pattern = sections[section];
    const auto first = pattern.find_first_of("0#");
    if (first == std::string::npos)
        return Unquoted(pattern);
    auto last = pattern.find_last_of("0#");
    const auto point = pattern.find('.', first);
    int decimals = 0, least = 0;
    if (point != std::string::npos && point < last)
        for (auto at = point + 1; at <= last; ++at)
            decimals += pattern[at] == '0' || pattern[at] == '#' ? 1 : 0, least += pattern[at] == '0' ? 1 : 0;
    decimals = std::min(decimals, 15);
    const bool percent = pattern.find('%') != std::string::npos;
    auto digits = Digits(value * (percent ? 100 : 1), decimals, pattern.find(',') < last);
    for (; decimals > least && digits.ends_with('0'); --decimals)
        digits.pop_back();
    if (digits.ends_with('.'))
        digits.pop_back();
    const auto whole = pattern.substr(first, std::min(point, last + 1) - first);
    const auto fewest = static_cast<std::size_t>(std::count(whole.begin(), whole.end(), '0'));
    if (const auto length = std::min(digits.find('.'), digits.size());
        length < std::min<std::size_t>(fewest, 30))
        digits.insert(0, std::min<std::size_t>(fewest, 30) - length, '0');
    std::string result = value < 0 && section == 0 ? "-" : "";
    result += Unquoted(std::string_view(pattern).substr(0, first));
    result += digits;
    result += Unquoted(std::string_view(pattern).substr(last + 1));
    return result;
}

std::optional<std::string> NamedNumber(double value, std::string_view format) {
    const std::string sign = value < 0 ? "-" : "";
    const auto is = [&](std::string_view name) { return text::EqualsIgnoringCase(format, name); };
    if (is("Currency"))
        return value < 0 ? "($" + Digits(value, 2, true) + ")" : "$" + Digits(value, 2, true);
    if (is("Euro"))
        return sign + "\u20AC" + Digits(value, 2, true);
    if (is("Standard"))
        return sign + Digits(value, 2, true);
    if (is("Percent"))
        return sign + Digits(value * 100, 2, false) + "%";
    if (is("General Number") || is("Scientific"))
        return Datum::Number(value).AsText();
    if (is("Fixed"))
        return sign + Digits(value, 2, false);
    if (is("Yes/No"))
        return value != 0 ? "Yes" : "No";
    if (is("True/False"))
        return value != 0 ? "True" : "False";
    if (is("On/Off"))
        return value != 0 ? "On" : "Off";
    return std::nullopt;
}

bool IsDatePattern(std::string_view format) {
    return text::ContainsIgnoringCase(format, "date") || text::ContainsIgnoringCase(format, "time") ||
           (format.find_first_of("dyhnDYHN") != std::string_view::npos &&
            format.find_first_of("0#@") == std::string_view::npos);
}

} // namespace

std::string FormatDatum(const Datum& value, std::string_view format) {
    if (value.IsNull())
        return {};
    if (value.kind == Datum::Kind::Date)
        return DateText(value.number, IsDatePattern(format) ? format : "");
    if (format.empty())
        return value.AsText();
    if (format.front() == '>')
        return text::ToUpper(value.AsText());
    if (format.front() == '<')
        return text::ToLower(value.AsText());
    const auto number = value.AsNumber();
    if (!number)
        return value.AsText();
    if (auto named = NamedNumber(*number, format))
        return *named;
    if (value.kind == Datum::Kind::Number && IsDatePattern(format))
        return DateText(*number, format);
    const bool pattern = format.find_first_of("0#") != std::string_view::npos;
    return pattern ? CustomNumber(*number, format) : value.AsText();
}

} // namespace tovimar::platform::access
