#include "platform/access/ExportEncoding.h"
#include "platform/access/ExportReader.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

std::string DecodeUtf16(std::string_view bytes, ExportEncoding encoding) {
    std::u16string units;
    units.reserve(bytes.size() / 2);
    for (std::size_t i = 0; i + 1 < bytes.size(); i += 2) {
        const auto first = static_cast<unsigned char>(bytes[i]);
        const auto second = static_cast<unsigned char>(bytes[i + 1]);
        const int unit = encoding == ExportEncoding::Utf16Little ? second << 8 | first : first << 8 | second;
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
    const auto encoding = FindExportEncoding(bytes);
    switch (encoding) {
    case ExportEncoding::Utf16Little:
    case ExportEncoding::Utf16Big:
        return DecodeUtf16(bytes, encoding);
    case ExportEncoding::Utf8:
        return text::MakeValidUtf8(bytes.substr(bytes.starts_with("\xEF\xBB\xBF") ? 3 : 0));
    case ExportEncoding::Ansi:
        break;
    }
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
