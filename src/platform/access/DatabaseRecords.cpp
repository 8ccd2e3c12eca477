#include "platform/Error.h"
#include "platform/access/DatabaseJson.h"
#include "platform/access/DatabaseReader.h"
#include "platform/access/Datum.h"
#include "platform/access/GuardedWork.h"
#include "platform/access/MdbFile.h"

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
