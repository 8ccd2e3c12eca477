#include "platform/Error.h"
#include "platform/access/DatabaseJson.h"
#include "platform/access/DatabaseReader.h"
#include "platform/access/GuardedWork.h"
#include "platform/access/MdbFile.h"

#include <cstdio>

namespace tovimar::platform::access {

Records::Type RecordType(FieldType type) {
    switch (type) {
    case FieldType::Boolean:
        return Records::Type::Boolean;
    case FieldType::Currency:
        return Records::Type::Currency;
    case FieldType::Date:
        return Records::Type::DateTime;
    case FieldType::Text:
    case FieldType::Guid:
        return Records::Type::Text;
    case FieldType::Memo:
        return Records::Type::Memo;
    case FieldType::Binary:
    case FieldType::LongBinary:
    case FieldType::Attachment:
        return Records::Type::Binary;
    default:
        return Records::Type::Number;
    }
}

namespace {

/// "2006-05-10 15:10:00" as "5/10/2006 3:10:00 PM"; a time alone stands on the day of the calendar's start.
std::string ReadableDate(const std::string& cell) {
    int year = 0, month = 0, day = 0, hour = 0, minute = 0, second = 0;
    if (std::sscanf(cell.c_str(), "%d-%d-%d %d:%d:%d", &year, &month, &day, &hour, &minute, &second) < 3)
        return cell;
    std::string readable;
    if (year != 1899)
        readable = std::to_string(month) + "/" + std::to_string(day) + "/" + std::to_string(year);
    if (hour != 0 || minute != 0 || second != 0) {
        char time[40];
        std::snprintf(time, sizeof(time), "%s%d:%02d:%02d %s", readable.empty() ? "" : " ",
                      hour % 12 == 0 ? 12 : hour % 12, minute, second, hour < 12 ? "AM" : "PM");
        readable += time;
    }
    return readable;
}

std::string ReadableCell(const std::string& cell, Records::Type type) {
    switch (type) {
    case Records::Type::Boolean:
        return cell == "1" ? "True" : "False";
    case Records::Type::DateTime:
        return cell.empty() ? cell : ReadableDate(cell);
    case Records::Type::Currency:
        return cell.ends_with("00") && cell.find('.') != std::string::npos ? cell.substr(0, cell.size() - 2)
                                                                           : cell;
    case Records::Type::Binary:
        return {};
    default:
        return cell;
    }
}

Records ReadRecords(const std::string& nativePath, const std::string& table, int rows) {
    MdbFile file(nativePath);
    const auto source = file.OpenTable(table);
    if (!source)
        throw RaisedError(kFailure1, nativePath + ": there is no table " + table + ".", "DatabaseReader");
    Records records;
    for (const auto& field : source->Definition().fields)
        records.columns.push_back({field.name, RecordType(field.type)});
    if (rows <= 0)
        return records;
    source->ForEachRow([&](const std::vector<std::string>& cells) {
        auto& row = records.rows.emplace_back();
        for (std::size_t i = 0; i < cells.size(); ++i)
            row.push_back(ReadableCell(cells[i], records.columns[i].type));
        return static_cast<int>(records.rows.size()) < rows;
    });
    return records;
}

} // namespace

Records ReadTableRecords(const std::string& nativePath, const std::string& table, int rows) {
    return RecordsFromJson(
        RunGuarded(nativePath, [&] { return RecordsToJson(ReadRecords(nativePath, table, rows)); }));
}

} // namespace tovimar::platform::access
