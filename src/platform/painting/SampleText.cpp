#include "platform/painting/SampleText.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstdio>

namespace tovimar::platform::painting {

namespace {

using Words = std::array<std::string_view, 4>;

struct Hint {
    std::string_view word; ///< within the folded field name
    SampleKind kind;
    Words rows;
};

/// The first hint whose word is found counts, so longer words come first.
constexpr std::array<Hint, 58> kHints{{
    {"email",
     SampleKind::Text,
     {"anna@example.com", "peter@example.com", "maria@example.com", "john@example.com"}},
    {"e-mail",
     SampleKind::Text,
     {"anna@example.com", "peter@example.com", "maria@example.com", "john@example.com"}},
    {"website",
     SampleKind::Text,
     {"www.example.com", "www.example.org", "www.example.net", "www.example.com"}},
    {"phone", SampleKind::Text, {"555-0101", "555-0144", "555-0172", "555-0198"}},
    {"mobile", SampleKind::Text, {"555-0101", "555-0144", "555-0172", "555-0198"}},
    {"fax", SampleKind::Text, {"555-0102", "555-0145", "555-0173", "555-0199"}},
    {"postcode", SampleKind::Text, {"2000", "3121", "4006", "5045"}},
    {"zip", SampleKind::Text, {"10001", "60614", "94103", "02139"}},
    {"city", SampleKind::Text, {"Springfield", "Riverside", "Franklin", "Clinton"}},
    {"suburb", SampleKind::Text, {"Riverside", "Newtown", "Hillview", "Parkdale"}},
    {"country", SampleKind::Text, {"Australia", "Canada", "Ireland", "Norway"}},
    {"address", SampleKind::Text, {"12 High Street", "7 Park Lane", "31 Mill Road", "4 Station Road"}},
    {"street", SampleKind::Text, {"12 High Street", "7 Park Lane", "31 Mill Road", "4 Station Road"}},
    {"company", SampleKind::Text, {"Northern Traders", "Harbour & Sons", "Bluehill Foods", "Oak Furniture"}},
    {"customer", SampleKind::Text, {"Northern Traders", "Harbour & Sons", "Bluehill Foods", "Oak Furniture"}},
    {"surname", SampleKind::Text, {"Miller", "Brown", "Garcia", "Walker"}},
    {"lastname", SampleKind::Text, {"Miller", "Brown", "Garcia", "Walker"}},
    {"last name", SampleKind::Text, {"Miller", "Brown", "Garcia", "Walker"}},
    {"gname", SampleKind::Text, {"Anna", "Peter", "Maria", "John"}},
    {"firstname", SampleKind::Text, {"Anna", "Peter", "Maria", "John"}},
    {"first name", SampleKind::Text, {"Anna", "Peter", "Maria", "John"}},
    {"fullname", SampleKind::Text, {"Anna Miller", "Peter Brown", "Maria Garcia", "John Walker"}},
    {"given", SampleKind::Text, {"Anna", "Peter", "Maria", "John"}},
    {"full path",
     SampleKind::Text,
     {"C:\\Data\\Report.txt", "C:\\Data\\List.csv", "C:\\Data\\Export.txt", "C:\\Data\\Data.csv"}},
    {"fullpath",
     SampleKind::Text,
     {"C:\\Data\\Report.txt", "C:\\Data\\List.csv", "C:\\Data\\Export.txt", "C:\\Data\\Data.csv"}},
    {"directory", SampleKind::Text, {"C:\\Data", "C:\\Data\\2023", "C:\\Data\\2022", "C:\\Archive"}},
    {"folder", SampleKind::Text, {"C:\\Data", "C:\\Data\\2023", "C:\\Data\\2022", "C:\\Archive"}},
    {"filename", SampleKind::Text, {"Report.txt", "Data.csv", "Export.txt", "List.csv"}},
    {"file name", SampleKind::Text, {"Report.txt", "Data.csv", "Export.txt", "List.csv"}},
    {"sex", SampleKind::Text, {"F", "M", "F", "M"}},
    {"gender", SampleKind::Text, {"F", "M", "F", "M"}},
    {"dob", SampleKind::Date, {"3/14/2001", "7/2/2003", "11/23/2002", "5/9/2004"}},
    {"birth", SampleKind::Date, {"3/14/2001", "7/2/2003", "11/23/2002", "5/9/2004"}},
    {"date", SampleKind::Date, {"3/14/2024", "4/2/2024", "5/23/2024", "6/9/2024"}},
    {"time", SampleKind::Text, {"9:30 AM", "10:15 AM", "1:45 PM", "3:00 PM"}},
    {"price", SampleKind::Money, {"24.50", "12.90", "149.00", "8.75"}},
    {"amount", SampleKind::Money, {"240.00", "95.50", "1120.00", "38.20"}},
    {"cost", SampleKind::Money, {"18.40", "9.95", "110.00", "6.10"}},
    {"total", SampleKind::Number, {"124", "87", "203", "56"}},
    {"points", SampleKind::Number, {"12", "8", "5", "3"}},
    {"quantity", SampleKind::Number, {"12", "4", "25", "8"}},
    {"qty", SampleKind::Number, {"12", "4", "25", "8"}},
    {"year", SampleKind::Number, {"2024", "2023", "2022", "2021"}},
    {"count", SampleKind::Number, {"12", "7", "31", "9"}},
    {"number", SampleKind::Number, {"101", "102", "103", "104"}},
    {"comment",
     SampleKind::Text,
     {"Checked and confirmed", "See attached note", "To be discussed", "Complete"}},
    {"description", SampleKind::Text, {"Standard item", "Second choice", "Special order", "Spare part"}},
    {"note", SampleKind::Text, {"Checked and confirmed", "See attached note", "To be discussed", "Complete"}},
    {"reason", SampleKind::Text, {"Special order", "Late delivery", "Good conduct", "Correction"}},
    {"remark",
     SampleKind::Text,
     {"Checked and confirmed", "See attached note", "To be discussed", "Complete"}},
    {"status", SampleKind::Text, {"Active", "Complete", "Active", "Pending"}},
    {"category", SampleKind::Text, {"Standard", "Special", "Standard", "Other"}},
    {"product", SampleKind::Text, {"Desk lamp", "Bookshelf", "Garden chair", "Toolbox"}},
    {"team", SampleKind::Text, {"Red", "Blue", "Green", "Yellow"}},
    {"currency", SampleKind::Text, {"USD", "EUR", "AUD", "GBP"}},
    {"percent", SampleKind::Number, {"5", "10", "20", "25"}},
    {"user", SampleKind::Text, {"amiller", "pbrown", "mgarcia", "jwalker"}},
    {"name", SampleKind::Text, {"Anna Miller", "Peter Brown", "Maria Garcia", "John Walker"}},
}};

const Hint* FindHint(std::string_view fieldName) {
    const auto folded = text::FoldCase(fieldName);
    for (const auto& hint : kHints)
        if (folded.find(hint.word) != std::string::npos)
            return &hint;
    return nullptr;
}

/// Numbers that count up from record to record.
bool CountsUp(std::string_view fieldName) {
    const auto folded = text::FoldCase(fieldName);
    for (const auto* ending : {"id", "no", "num", "place", "lane", "level", "order"})
        if (folded.ends_with(ending))
            return true;
    return folded == "pin" || folded.find('#') != std::string::npos;
}

bool LooksLikeNumber(std::string_view fieldName) {
    return CountsUp(fieldName) || text::EqualsIgnoringCase(fieldName, "age");
}

bool Is(std::string_view format, std::string_view name) {
    return text::EqualsIgnoringCase(format, name);
}

} // namespace

SampleKind KindOf(std::string_view format, std::string_view fieldName) {
    for (const auto* date : {"General Date", "Long Date", "Medium Date", "Short Date"})
        if (Is(format, date))
            return SampleKind::Date;
    if (Is(format, "Currency"))
        return SampleKind::Money;
    for (const auto* number : {"Fixed", "Standard", "General Number", "Percent", "Scientific"})
        if (Is(format, number))
            return SampleKind::Number;
    if (format.find("yy") != std::string_view::npos)
        return SampleKind::Date;
    if (const auto* hint = FindHint(fieldName))
        return hint->kind;
    return LooksLikeNumber(fieldName) ? SampleKind::Number : SampleKind::Text;
}

bool HasSampleWords(std::string_view fieldName) {
    return FindHint(fieldName) != nullptr;
}

bool SaysItsKind(std::string_view fieldName) {
    return HasSampleWords(fieldName) || LooksLikeNumber(fieldName);
}

std::string SampleText(SampleKind kind, std::string_view format, std::string_view fieldName, int row) {
    const auto at = static_cast<std::size_t>(row < 0 ? 0 : row) % std::tuple_size_v<Words>;
    const auto* hint = FindHint(fieldName);
    if (hint != nullptr && hint->kind == kind)
        return std::string(hint->rows[at]);
    switch (kind) {
    case SampleKind::Number: {
        if (CountsUp(fieldName))
            return std::to_string(std::max(0, row) + 1);
        static constexpr Words kNumbers{"12", "7", "31", "9"};
        return std::string(Is(format, "Percent") ? "0.25" : kNumbers[at]);
    }
    case SampleKind::Money: {
        static constexpr Words kMoney{"24.50", "12.90", "149.00", "8.75"};
        return std::string(kMoney[at]);
    }
    case SampleKind::Date: {
        static constexpr Words kDates{"3/14/2024", "4/2/2024", "5/23/2024", "6/9/2024"};
        return std::string(kDates[at]);
    }
    case SampleKind::Boolean:
        return at % 2 == 0 ? "Yes" : "No";
    case SampleKind::Text:
        break;
    }
    return {};
}

} // namespace tovimar::platform::painting
