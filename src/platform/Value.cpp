#include "platform/Value.h"

#include "platform/Error.h"

#include <charconv>
#include <cmath>
#include <optional>

namespace tovimar {
namespace {

[[noreturn]] void RaiseTypeMismatch() {
    throw RaisedError(13, "Type mismatch", "Value");
}

std::optional<double> ParseNumber(const std::string& text) {
    const auto first = text.find_first_not_of(" \t");
    if (first == std::string::npos)
        return std::nullopt;
    const auto last = text.find_last_not_of(" \t");
    const char* begin = text.data() + first + (text[first] == '+' ? 1 : 0);
    const char* end = text.data() + last + 1;
    double number = 0;
    const auto [stop, error] = std::from_chars(begin, end, number);
    if (error != std::errc() || stop != end)
        return std::nullopt;
    return number;
}

bool EqualsAsciiIgnoringCase(const std::string& text, const char* lower) {
    std::size_t i = 0;
    for (; i < text.size() && lower[i] != 0; ++i)
        if ((text[i] >= 'A' && text[i] <= 'Z' ? text[i] + 32 : text[i]) != lower[i])
            return false;
    return i == text.size() && lower[i] == 0;
}

std::string NumberText(double number) {
    char buffer[32];
    const auto [end, error] = std::to_chars(buffer, buffer + sizeof buffer, number);
    return error == std::errc() ? std::string(buffer, end) : std::string();
}

} // namespace

bool Value::AsBoolean() const {
    if (const auto* text = std::get_if<std::string>(&data_)) {
        if (EqualsAsciiIgnoringCase(*text, "true"))
            return true;
        if (EqualsAsciiIgnoringCase(*text, "false"))
            return false;
    }
    return AsDouble() != 0;
}

std::int32_t Value::AsInteger() const {
    if (const auto* number = std::get_if<std::int32_t>(&data_))
        return *number;
    const double rounded = std::nearbyint(AsDouble());
    if (!(rounded >= -2147483648.0 && rounded <= 2147483647.0))
        throw RaisedError(6, "Overflow", "Value");
    return static_cast<std::int32_t>(rounded);
}

double Value::AsDouble() const {
    if (IsNull())
        return 0;
    if (const auto* flag = std::get_if<bool>(&data_))
        return *flag ? -1 : 0;
    if (const auto* number = std::get_if<std::int32_t>(&data_))
        return *number;
    if (const auto* number = std::get_if<double>(&data_))
        return *number;
    if (const auto* text = std::get_if<std::string>(&data_))
        if (const auto number = ParseNumber(*text))
            return *number;
    RaiseTypeMismatch();
}

std::string Value::AsString() const {
    if (IsNull())
        return {};
    if (const auto* text = std::get_if<std::string>(&data_))
        return *text;
    if (const auto* flag = std::get_if<bool>(&data_))
        return *flag ? "True" : "False";
    if (const auto* number = std::get_if<std::int32_t>(&data_))
        return std::to_string(*number);
    if (const auto* number = std::get_if<double>(&data_))
        return NumberText(*number);
    RaiseTypeMismatch();
}

HostObject Value::AsObject() const {
    if (const auto* object = std::get_if<HostObject>(&data_))
        return *object;
    return nullptr;
}

} // namespace tovimar
