#include "platform/access/ExportReader.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>

namespace tovimar::platform::access {

namespace {

enum class Utf16Order { None, Little, Big };

/// Order of a UTF-16 text: by its mark, else by zero bytes, which no other text encoding has in its start.
Utf16Order FindUtf16Order(std::string_view bytes) {
    if (bytes.starts_with("\xFF\xFE"))
        return Utf16Order::Little;
    if (bytes.starts_with("\xFE\xFF"))
        return Utf16Order::Big;
    const auto start = bytes.substr(0, std::min<std::size_t>(bytes.size() & ~std::size_t{1}, 256));
    std::array<std::size_t, 2> zeros{};
    for (std::size_t i = 0; i < start.size(); ++i)
        if (start[i] == '\0')
            ++zeros[i % 2];
    const std::size_t many = start.size() / 4;
    if (many > 0 && zeros[1] > many && zeros[0] == 0)
        return Utf16Order::Little;
    if (many > 0 && zeros[0] > many && zeros[1] == 0)
        return Utf16Order::Big;
    return Utf16Order::None;
}

std::string DecodeUtf16(std::string_view bytes, Utf16Order order) {
    std::u16string units;
    units.reserve(bytes.size() / 2);
    for (std::size_t i = 0; i + 1 < bytes.size(); i += 2) {
        const auto first = static_cast<unsigned char>(bytes[i]);
        const auto second = static_cast<unsigned char>(bytes[i + 1]);
        const int unit = order == Utf16Order::Little ? second << 8 | first : first << 8 | second;
        if (unit != 0xFEFF)
            units.push_back(static_cast<char16_t>(unit));
    }
    return text::FromUtf16(units);
}

std::string_view TrimLine(std::string_view line) {
    const auto first = line.find_first_not_of(" \t\r");
    if (first == std::string_view::npos)
        return {};
    return line.substr(first, line.find_last_not_of(" \t\r") - first + 1);
}

/// Next line without its end; `position` moves behind it.
std::string_view TakeLine(std::string_view source, std::size_t& position) {
    const auto end = std::min(source.find('\n', position), source.size());
    const auto line = source.substr(position, end - position);
    position = end + 1;
    return line;
}

bool StartsWithAny(std::string_view line, std::initializer_list<std::string_view> starts) {
    return std::any_of(starts.begin(), starts.end(),
                       [&](std::string_view start) { return text::StartsWithIgnoringCase(line, start); });
}

/// What one line tells; none of it for a line that stands in front of every kind ("Version =21").
ExportContent RecognizeLine(std::string_view line, bool& decided) {
    decided = true;
    if (text::EqualsIgnoringCase(line, "Begin Form"))
        return ExportContent::Form;
    if (text::EqualsIgnoringCase(line, "Begin Report"))
        return ExportContent::Report;
    if (StartsWithAny(line, {"dbMemo \"", "Operation =", "Begin InputTables", "Begin OutputColumns"}))
        return ExportContent::Query;
    if (StartsWithAny(line, {"ColumnsShown =", "Action =", "MacroName ="}))
        return ExportContent::Macro;
    if (StartsWithAny(line, {"Attribute VB_", "Option Compare", "Option Explicit", "VERSION 1.0 CLASS"}))
        return ExportContent::Module;
    if (StartsWithAny(line, {"CREATE TABLE", "CREATE INDEX", "CREATE UNIQUE INDEX"}))
        return ExportContent::TableSql;
    if (StartsWithAny(line, {"SELECT", "PARAMETERS", "TRANSFORM", "INSERT ", "UPDATE ", "DELETE", "(SELECT"}))
        return ExportContent::QuerySql;
    if (line.starts_with('{') || line.starts_with('['))
        return ExportContent::Json;
    if (line.starts_with('<'))
        return ExportContent::Xml;
    decided = !StartsWithAny(line, {"Version", "PublishOption", "Checksum", "Begin"});
    return ExportContent::Unknown;
}

bool IsHeaderLine(std::string_view line, bool& inClassHeader) {
    if (text::StartsWithIgnoringCase(line, "VERSION 1.0 CLASS")) {
        inClassHeader = true;
        return true;
    }
    if (inClassHeader) {
        inClassHeader = !text::EqualsIgnoringCase(line, "END");
        return true;
    }
    return text::StartsWithIgnoringCase(line, "Attribute ") && line.find('=') != std::string_view::npos;
}

} // namespace

std::string DecodeExportText(std::string_view bytes) {
    const auto order = FindUtf16Order(bytes);
    if (order != Utf16Order::None)
        return DecodeUtf16(bytes, order);
    if (bytes.starts_with("\xEF\xBB\xBF"))
        return text::MakeValidUtf8(bytes.substr(3));
    if (text::IsValidUtf8(bytes))
        return std::string(bytes);
    return text::AnsiCodePage().Decode(bytes);
}

ExportContent RecognizeExport(std::string_view source) {
    std::size_t position = 0;
    for (int lines = 0; lines < 200 && position < source.size(); ++lines) {
        const auto line = TrimLine(TakeLine(source, position));
        bool decided = false;
        const auto content = line.empty() ? ExportContent::Unknown : RecognizeLine(line, decided);
        if (decided)
            return content;
    }
    return ExportContent::Unknown;
}

std::string VisibleCode(std::string_view code) {
    std::string visible;
    visible.reserve(code.size());
    bool inClassHeader = false;
    for (std::size_t position = 0; position < code.size();) {
        const auto start = position;
        const auto line = TakeLine(code, position);
        if (!IsHeaderLine(TrimLine(line), inClassHeader))
            visible += code.substr(start, position - start);
    }
    return visible;
}

} // namespace tovimar::platform::access
