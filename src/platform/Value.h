#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <variant>

namespace tovimar {

class AutomationObject;

/// Opaque reference to an object of the host; null means absent.
using HostObject = std::shared_ptr<AutomationObject>;

/// A late-bound value: null, Boolean, 32-bit integer, double, string (UTF-8) or object.
/// The conversions follow the automation rules: a null reads as False, 0 and "", a Boolean as text is
/// "True" or "False" and as a number -1 or 0, numeric text converts to numbers.
class Value {
public:
    Value() = default;
    Value(bool value) : data_(value) {}
    Value(std::int32_t value) : data_(value) {}
    Value(double value) : data_(value) {}
    Value(std::string value) : data_(std::move(value)) {}
    Value(const char* value) : data_(std::string(value)) {}
    Value(HostObject value) : data_(std::move(value)) {}

    bool IsNull() const { return std::holds_alternative<std::monostate>(data_); }
    bool IsBoolean() const { return std::holds_alternative<bool>(data_); }
    bool IsInteger() const { return std::holds_alternative<std::int32_t>(data_); }
    bool IsDouble() const { return std::holds_alternative<double>(data_); }
    bool IsString() const { return std::holds_alternative<std::string>(data_); }
    bool IsObject() const { return std::holds_alternative<HostObject>(data_); }

    /// "True", "-1" and every non-zero number are True, without regard to case.
    /// Raises error 13 "Type mismatch" for other text that is no number.
    bool AsBoolean() const;
    /// Doubles round to nearest, halves to even. Raises error 13 for text that is no number.
    std::int32_t AsInteger() const;
    double AsDouble() const;
    /// Objects have no text: raises error 13.
    std::string AsString() const;
    /// Null for every value that is no object.
    HostObject AsObject() const;

    friend bool operator==(const Value&, const Value&) = default;

private:
    std::variant<std::monostate, bool, std::int32_t, double, std::string, HostObject> data_;
};

} // namespace tovimar
