#pragma once

#include "platform/access/OpenObject.h"

#include <optional>
#include <string>
#include <string_view>

/// Values of records and expressions, and how the host shows them.
namespace tovimar::platform::access {

struct Datum {
    enum class Kind { Null, Number, Text, Boolean, Date };
    Kind kind = Kind::Null;
    double number = 0; ///< a Boolean's 0 or -1; a date's days since 30 December 1899
    std::string text;  ///< of a text

    static Datum Number(double value) { return {Kind::Number, value, {}}; }
    static Datum Text(std::string value) { return {Kind::Text, 0, std::move(value)}; }
    static Datum Boolean(bool value) { return {Kind::Boolean, value ? -1.0 : 0.0, {}}; }
    static Datum Date(double days) { return {Kind::Date, days, {}}; }

    bool IsNull() const { return kind == Kind::Null; }
    /// Its number, or the number that its text spells; none for null and other texts.
    std::optional<double> AsNumber() const;
    /// As the host shows it where no format is set; empty for null.
    std::string AsText() const;
    /// Not null, not zero, not "False".
    bool IsTrue() const;
};

/// Below 0, 0, above 0; texts without regard to case. None where one is null or they can't be compared.
std::optional<int> Compare(const Datum& left, const Datum& right);

/// A cell of a record: `Records` holds texts as a person reads them.
Datum DatumOf(const std::string& cell, Records::Type type);
/// A cell as a source spells it ("2024-09-01 00:00:00", "1") as `Records` holds it.
std::string ReadableCell(const std::string& cell, Records::Type type);

/// "3/14/2024", "2024-03-14", either with a time, or a time alone; days since 30 December 1899.
std::optional<double> ParseDate(std::string_view text);

/// A value in a format of the host: "Currency", "Short Date", "d-mmm-yy", "#,##0.00", ">", ...
/// An unknown format, and one for another kind of value, shows the plain text.
std::string FormatDatum(const Datum& value, std::string_view format);

} // namespace tovimar::platform::access
