#include "platform/access/ExpressionNode.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <functional>
#include <unordered_map>

namespace tovimar::platform::access {

namespace {

using Data = std::vector<Datum>;
using Value = std::optional<Datum>;

/// "*" any characters, "?" one, "#" a digit; without regard to case.
bool Matches(const std::string& word, const std::string& pattern) {
    std::size_t at = 0, in = 0, star = std::string::npos, retry = 0;
    while (at < word.size()) {
        const bool one = in < pattern.size() && (pattern[in] == '?' || pattern[in] == word[at] ||
                                                 (pattern[in] == '#' && word[at] >= '0' && word[at] <= '9'));
        if (in < pattern.size() && pattern[in] == '*') {
            star = in++;
            retry = at;
        } else if (one) {
            ++in;
            ++at;
        } else if (star != std::string::npos) {
            in = star + 1;
            at = ++retry;
        } else {
            return false;
        }
    }
    while (in < pattern.size() && pattern[in] == '*')
        ++in;
    return in == pattern.size();
}

Value Arithmetic(const std::string& operation, const Datum& left, const Datum& right) {
    if (left.IsNull() || right.IsNull())
        return Datum{};
    const auto a = left.AsNumber(), b = right.AsNumber();
    if (operation == "+" && left.kind == Datum::Kind::Text && right.kind == Datum::Kind::Text)
        return Datum::Text(left.text + right.text);
    if (!a || !b)
        return std::nullopt;
    double result = 0;
    if (operation == "+")
        result = *a + *b;
    else if (operation == "-")
        result = *a - *b;
    else if (operation == "*")
        result = *a * *b;
    else if (operation == "^")
        result = std::pow(*a, *b);
    else if (*b == 0)
        return std::nullopt;
    else if (operation == "/")
        result = *a / *b;
    else
        result = operation == "mod" ? std::fmod(std::nearbyint(*a), std::nearbyint(*b)) : std::trunc(*a / *b);
    if (!std::isfinite(result))
        return std::nullopt;
    const bool dates = left.kind == Datum::Kind::Date && right.kind == Datum::Kind::Number;
    return dates && (operation == "+" || operation == "-") ? Datum::Date(result) : Datum::Number(result);
}

Value Comparison(const std::string& operation, const Datum& left, const Datum& right) {
    const auto order = Compare(left, right);
    if (!order)
        return Datum{};
    const bool result = operation == "="    ? *order == 0
                        : operation == "<>" ? *order != 0
                        : operation == "<"  ? *order < 0
                        : operation == ">"  ? *order > 0
                        : operation == "<=" ? *order <= 0
                                            : *order >= 0;
    return Datum::Boolean(result);
}

double NumberOf(const Data& arguments, std::size_t at, double absent = 0) {
    return at < arguments.size() ? arguments[at].AsNumber().value_or(absent) : absent;
}
std::size_t CountOf(const Data& arguments, std::size_t at, double absent) {
    return static_cast<std::size_t>(std::clamp(NumberOf(arguments, at, absent), 0.0, 1e6));
}
std::string TextOf(const Data& arguments, std::size_t at) {
    return at < arguments.size() ? arguments[at].AsText() : std::string();
}

using Function = std::function<Value(const Data&)>;

/// A function of a text that null goes through.
template <typename Change> Function OfText(const Change& change) {
    return [change](const Data& arguments) -> Value {
        return arguments.empty() || arguments[0].IsNull() ? Datum{} : Datum::Text(change(arguments));
    };
}
/// A function of a number that null goes through.
template <typename Change> Function OfNumber(const Change& change) {
    return [change](const Data& arguments) -> Value {
        if (arguments.empty() || arguments[0].IsNull())
            return Datum{};
        const auto number = arguments[0].AsNumber();
        return number ? Value(Datum::Number(change(*number, arguments))) : std::nullopt;
    };
}
Function DatePart(const char* format) {
    return [format](const Data& arguments) -> Value {
        const auto days = arguments.empty()                        ? std::nullopt
                          : arguments[0].kind == Datum::Kind::Text ? ParseDate(arguments[0].text)
                                                                   : arguments[0].AsNumber();
        if (!days)
            return arguments.empty() ? std::nullopt : Value(Datum{});
        return Datum::Number(Datum::Text(FormatDatum(Datum::Date(*days), format)).AsNumber().value_or(0));
    };
}

double Rounded(double value, const Data& arguments) {
    const double scale = std::pow(10.0, std::clamp(NumberOf(arguments, 1), 0.0, 12.0));
    return std::nearbyint(value * scale) / scale;
}

std::string LeftTrimmed(const Data& arguments) {
    const auto text = TextOf(arguments, 0);
    const auto from = text.find_first_not_of(' ');
    return from == std::string::npos ? std::string() : text.substr(from);
}

Value Format(const Data& arguments) {
    auto value = arguments.empty() ? Datum{} : arguments[0];
    const auto format = TextOf(arguments, 1);
    return value.IsNull() ? Datum::Text("") : Datum::Text(FormatDatum(value, format));
}

Value Choose(const Data& arguments) {
    const auto at = CountOf(arguments, 0, 0);
    return at >= 1 && at < arguments.size() ? arguments[at] : Datum{};
}

Value Switch(const Data& arguments) {
    for (std::size_t i = 0; i + 1 < arguments.size(); i += 2)
        if (arguments[i].IsTrue())
            return arguments[i + 1];
    return Datum{};
}

const std::unordered_map<std::string, Function>& Functions() {
    static const auto plain = [](double value, const Data&) { return value; };
    static const std::unordered_map<std::string, Function> functions = {
        {"nz",
         [](const Data& a) -> Value {
             return a.empty() ? Datum{} : !a[0].IsNull() ? a[0] : a.size() > 1 ? a[1] : Datum::Text("");
         }},
        {"isnull", [](const Data& a) -> Value { return Datum::Boolean(a.empty() || a[0].IsNull()); }},
        {"isnumeric", [](const Data& a) -> Value { return Datum::Boolean(!a.empty() && a[0].AsNumber()); }},
        {"ucase", OfText([](const Data& a) { return text::ToUpper(TextOf(a, 0)); })},
        {"lcase", OfText([](const Data& a) { return text::ToLower(TextOf(a, 0)); })},
        {"trim", OfText([](const Data& a) { return text::Trim(TextOf(a, 0)); })},
        {"ltrim", OfText(LeftTrimmed)},
        {"rtrim", OfText([](const Data& a) { return TextOf(a, 0); })},
        {"left", OfText([](const Data& a) { return text::Left(TextOf(a, 0), CountOf(a, 1, 0)); })},
        {"right", OfText([](const Data& a) { return text::Right(TextOf(a, 0), CountOf(a, 1, 0)); })},
        {"mid", OfText([](const Data& a) {
             return text::Mid(TextOf(a, 0), std::max<std::size_t>(1, CountOf(a, 1, 1)), CountOf(a, 2, 1e6));
         })},
        {"replace", OfText([](const Data& a) {
             return TextOf(a, 1).empty()
                        ? TextOf(a, 0)
                        : text::ReplaceAllIgnoringCase(TextOf(a, 0), TextOf(a, 1), TextOf(a, 2));
         })},
        {"cstr", OfText([](const Data& a) { return TextOf(a, 0); })},
        {"str", OfText([](const Data& a) { return (NumberOf(a, 0) >= 0 ? " " : "") + TextOf(a, 0); })},
        {"len",
         [](const Data& a) -> Value {
             return a.empty() || a[0].IsNull()
                        ? Datum{}
                        : Datum::Number(static_cast<double>(text::Length(TextOf(a, 0))));
         }},
        {"format", Format},
        {"choose", Choose},
        {"switch", Switch},
        {"val", [](const Data& a) -> Value { return Datum::Number(std::atof(TextOf(a, 0).c_str())); }},
        {"cint", OfNumber([](double v, const Data&) { return std::nearbyint(v); })},
        {"clng", OfNumber([](double v, const Data&) { return std::nearbyint(v); })},
        {"cdbl", OfNumber(plain)},
        {"csng", OfNumber(plain)},
        {"ccur", OfNumber(plain)},
        {"int", OfNumber([](double v, const Data&) { return std::floor(v); })},
        {"fix", OfNumber([](double v, const Data&) { return std::trunc(v); })},
        {"abs", OfNumber([](double v, const Data&) { return std::fabs(v); })},
        {"round", OfNumber(Rounded)},
        {"date", [](const Data&) -> Value { return Datum::Date(kSampleToday); }},
        {"now", [](const Data&) -> Value { return Datum::Date(kSampleNow); }},
        {"time", [](const Data&) -> Value { return Datum::Date(kSampleNow - kSampleToday); }},
        {"year", DatePart("yyyy")},
        {"month", DatePart("m")},
        {"day", DatePart("d")},
        {"hour", DatePart("h")},
        {"minute", DatePart("n")}};
    return functions;
}

} // namespace

std::optional<Datum> ConstantNamed(const std::string& folded) {
    if (folded == "true" || folded == "yes" || folded == "on")
        return Datum::Boolean(true);
    if (folded == "false" || folded == "no" || folded == "off")
        return Datum::Boolean(false);
    if (folded == "null")
        return Datum{};
    return std::nullopt;
}

bool IsAggregateFunction(const std::string& function) {
    for (const auto* name : {"sum", "count", "avg", "min", "max", "first", "last"})
        if (function == name)
            return true;
    return false;
}

std::optional<Datum> Operate(const std::string& operation, const std::vector<Datum>& operands) {
    const auto& left = operands[0];
    if (operation == "not")
        return left.IsNull() ? left : Datum::Boolean(!left.IsTrue());
    if (operation == "negative")
        return Arithmetic("-", Datum::Number(0), left);
    if (operation == "is null")
        return Datum::Boolean(left.IsNull());
    if (operation == "in")
        return Datum::Boolean(std::any_of(operands.begin() + 1, operands.end(),
                                          [&](const Datum& other) { return Compare(left, other) == 0; }));
    const auto& right = operands[1];
    if (operation == "between")
        return Datum::Boolean(Compare(left, right).value_or(-1) >= 0 &&
                              Compare(left, operands[2]).value_or(1) <= 0);
    if (operation == "&")
        return Datum::Text(left.AsText() + right.AsText());
    if (operation == "like")
        return Datum::Boolean(!left.IsNull() &&
                              Matches(text::FoldCase(left.AsText()), text::FoldCase(right.AsText())));
    if (operation == "xor")
        return Datum::Boolean(left.IsTrue() != right.IsTrue());
    const bool comparing = operation.find_first_of("=<>") != std::string::npos;
    return comparing ? Comparison(operation, left, right) : Arithmetic(operation, left, right);
}

std::optional<Datum> CallFunction(const std::string& function, const std::vector<Datum>& arguments) {
    const auto found = Functions().find(function);
    return found == Functions().end() ? std::nullopt : found->second(arguments);
}

} // namespace tovimar::platform::access
