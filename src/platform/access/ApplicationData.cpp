#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/access/ApplicationModel.h"
#include "platform/access/Datum.h"
#include "platform/access/ExportReader.h"
#include "platform/access/QueryReader.h"
#include "platform/access/QueryRunner.h"
#include "platform/access/TableReader.h"
#include "platform/access/ThemeReader.h"
#include "platform/access/database/DatabaseDesigns.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <algorithm>

/// The data side of the application: tables, queries, and the records behind forms.
namespace tovimar::platform::access {

namespace {

constexpr int kMaxQueryDepth = 8;
/// Of a table: enough for joins to find their partners, little enough for any table to be read.
constexpr int kMostRows = 3000;

std::string ReadText(const std::string& path) {
    return DecodeExportText(Env().files->ReadFile(path));
}

bool IsStatement(const std::string& source) {
    for (const auto* word : {"SELECT", "PARAMETERS", "TRANSFORM", "("})
        if (text::StartsWithIgnoringCase(source, word))
            return true;
    return false;
}

/// Names with or without brackets, a statement with or without its final semicolon.
std::string CleanSource(const std::string& source) {
    auto clean = text::TrimWhitespace(source);
    while (clean.ends_with(';'))
        clean = text::TrimWhitespace(clean.substr(0, clean.size() - 1));
    const bool bracketed = clean.size() > 2 && clean.starts_with('[') && clean.find(']') == clean.size() - 1;
    return bracketed ? clean.substr(1, clean.size() - 2) : clean;
}

/// Cells of data files take the types of the table's fields and are spelled as those show.
void TakeTypes(const TableDefinition& table, Records& records) {
    for (std::size_t i = 0; i < records.columns.size(); ++i) {
        auto& column = records.columns[i];
        for (const auto& field : table.fields)
            if (text::EqualsIgnoringCase(field.name, column.name))
                column.type = RecordType(field.type);
        for (auto& cells : records.rows)
            if (i < cells.size())
                cells[i] = ReadableCell(cells[i], column.type);
    }
}

Records FirstOf(const Records* records, int rows) {
    if (records == nullptr)
        return {};
    const auto count = std::min(records->rows.size(), static_cast<std::size_t>(std::max(0, rows)));
    return {records->columns,
            {records->rows.begin(), records->rows.begin() + static_cast<std::ptrdiff_t>(count)}};
}

void TakeFields(const Records& records, TableDefinition& table) {
    for (const auto& column : records.columns) {
        FieldDefinition field;
        field.name = column.name;
        table.fields.push_back(std::move(field));
    }
}

/// Reads a definition at the first question; a failure is kept and raised at every one.
template <typename Part, typename Read> void LoadOnce(Part& part, const Read& read) {
    if (!part.loaded) {
        part.loaded = true;
        try {
            read();
        } catch (const RaisedError& failure) {
            part.error = failure.what();
        }
    }
    if (!part.error.empty())
        throw RaisedError(kFailure1, part.error, "AccessApplication");
}

} // namespace

/// Tables and queries for resolving fields; one that can't be read counts as unknown there.
FieldSources ApplicationModel::Sources() {
    const auto find = [](const auto& look) -> decltype(look()) {
        try {
            return look();
        } catch (const RaisedError&) {
            return nullptr;
        }
    };
    return {[this, find](const std::string& name) { return find([&] { return FindTable(name); }); },
            [this, find](const std::string& name) { return find([&] { return FindQuery(name); }); }};
}

ApplicationModel::Table& ApplicationModel::TableNamed(const std::string& name) {
    if (auto* known = tables_.Find(name))
        return **known;
    tables_.Add(std::make_unique<Table>(), name);
    auto& table = **tables_.Find(name);
    table.definition.name = name;
    return table;
}

void ApplicationModel::LoadTable(Table& table) {
    LoadOnce(table, [&] { ReadTable(table); });
}

void ApplicationModel::ReadTable(Table& table) {
    const auto name = table.definition.name;
    auto& definition = table.definition;
    if (!table.sqlPath.empty())
        definition = ReadTableSql(ReadText(table.sqlPath), name);
    else if (!table.linkPath.empty())
        definition = ReadLinkedTable(ReadText(table.linkPath), name, Env().files->ToNative(table.linkPath));
    definition.name = name;
    if (!table.schemaPath.empty())
        MergeTableSchema(ReadText(table.schemaPath), Env().files->ToNative(table.schemaPath), definition);
    if (definition.fields.empty() && !table.dataPath.empty())
        TakeFields(ReadTableData(ReadText(table.dataPath), Env().files->ToNative(table.dataPath), 1),
                   definition);
}

void ApplicationModel::LoadQuery(Query& query) {
    LoadOnce(query, [&] { ReadQuery(query); });
}

void ApplicationModel::ReadQuery(Query& query) {
    const auto name = query.definition.name;
    const auto source = ReadText(query.path);
    const bool isExport = RecognizeExport(source) == ExportContent::Query;
    query.definition =
        isExport ? ReadQueryExport(source, Env().files->ToNative(query.path)) : ParseQuerySql(source);
    query.definition.name = name;
    if (!query.infoPath.empty())
        for (auto& property : ReadQueryInfo(ReadText(query.infoPath), Env().files->ToNative(query.infoPath)))
            query.definition.properties.push_back(std::move(property));
}

const TableDefinition* ApplicationModel::FindTable(const std::string& name) {
    auto* table = tables_.Find(name);
    if (!table)
        return nullptr;
    LoadTable(**table);
    return &(*table)->definition;
}

const QueryDefinition* ApplicationModel::FindQuery(const std::string& name) {
    auto* query = queries_.Find(name);
    if (!query)
        return nullptr;
    LoadQuery(**query);
    return &(*query)->definition;
}

const std::vector<FieldDefinition>& ApplicationModel::QueryFields(const std::string& name) {
    static const std::vector<FieldDefinition> kNone;
    auto* found = queries_.Find(name);
    if (!found)
        return kNone;
    auto& query = **found;
    LoadQuery(query);
    if (!query.resolved) {
        query.fields = ResolveQueryFields(query.definition, Sources());
        query.resolved = true;
    }
    return query.fields;
}

const Records* ApplicationModel::FindRecords(const std::string& recordSource, int rows) {
    const auto source = CleanSource(recordSource);
    return source.empty() ? nullptr : KnownRecords(source, std::min(rows, kMostRows), 0);
}

/// Tables and queries are worked out once, however many forms and queries build on them.
const Records* ApplicationModel::KnownRecords(const std::string& source, int rows, int depth) {
    const auto key = text::FoldCase(source) + "\n" + std::to_string(rows);
    const auto known = records_.find(key);
    if (known != records_.end())
        return known->second.get();
    // A query that leads back to itself finds nothing here.
    records_[key] = nullptr;
    try {
        auto records = std::make_unique<Records>(ReadRecords(source, rows, depth));
        if (!records->columns.empty())
            records_[key] = std::move(records);
    } catch (const RaisedError&) {
        records_[key] = nullptr; // sample text stands in where the data can't be had
    }
    return records_[key].get();
}

Records ApplicationModel::ReadRecords(const std::string& source, int rows, int depth) {
    if (auto* table = tables_.Find(source)) {
        LoadTable(**table);
        if (rows == kMostRows)
            return TableRecords(**table);
        return FirstOf(KnownRecords(source, kMostRows, depth), rows);
    }
    if (const auto* query = FindQuery(source))
        return QueryRecords(*query, QueryFields(source), rows, depth);
    if (!IsStatement(source))
        return {};
    const auto query = ParseQuerySql(source);
    return QueryRecords(query, ResolveQueryFields(query, Sources()), rows, depth);
}

Records ApplicationModel::TableRecords(Table& table) {
    Records records;
    if (!table.dataPath.empty()) {
        records = ReadTableData(ReadText(table.dataPath), Env().files->ToNative(table.dataPath), kMostRows);
        TakeTypes(table.definition, records);
    } else if (!table.database.empty() && table.definition.connect.empty()) {
        records = ReadTableRecords(table.database, table.definition.name, kMostRows);
    }
    if (records.columns.empty())
        for (const auto& field : table.definition.fields)
            records.columns.push_back({field.name, RecordType(field.type)});
    return records;
}

Records ApplicationModel::QueryRecords(const QueryDefinition& query,
                                       const std::vector<FieldDefinition>& fields, int rows, int depth) {
    if (depth < kMaxQueryDepth) {
        auto records = RunQuery(
            query, [&](const std::string& name) { return KnownRecords(name, kMostRows, depth + 1); }, rows);
        if (records && !records->rows.empty())
            return std::move(*records);
    }
    Records records;
    for (const auto& field : fields)
        records.columns.push_back(
            {field.name, field.sourceField.empty() ? Records::Type::Unknown : RecordType(field.type)});
    return records;
}

std::string ApplicationModel::FindPicture(const std::string& name) {
    const auto* path = pictures_.Find(name);
    if (path && Env().files->FileExists(*path))
        return Env().files->ReadFile(*path);
    return FromDesigns([&](DatabaseDesigns& designs) { return designs.Picture(name); });
}

/// The first answer of the databases that lie at hand; one that can't be read has none.
std::string ApplicationModel::FromDesigns(const std::function<std::string(DatabaseDesigns&)>& ask) {
    for (auto& [path, designs] : databaseDesigns_) {
        try {
            if (auto answer = ask(*designs); !answer.empty())
                return answer;
        } catch (const RaisedError&) {
            continue;
        }
    }
    return {};
}

/// Bytes of the theme that the database's properties name; empty where the source has none.
std::string ApplicationModel::ThemeFile() {
    const auto properties = folder_ + "\\dbs-properties.json";
    if (!Env().files->FileExists(properties))
        return FromDesigns([](DatabaseDesigns& designs) { return designs.Theme(); });
    const auto name = JsonText(ReadText(properties), Env().files->ToNative(properties),
                               {"Items", "Theme Resource Name", "Value"});
    const auto path = folder_ + "\\themes\\" + name + ".thmx";
    const bool plain = !name.empty() && name.find_first_of("\\/:") == std::string::npos;
    return plain && Env().files->FileExists(path) ? Env().files->ReadFile(path) : std::string();
}

const std::vector<std::uint32_t>& ApplicationModel::ThemeColors() {
    // The palette "Office" that the host gives a new database.
    static const std::vector<std::uint32_t> kOffice = {0x000000, 0xFFFFFF, 0x1F497D, 0xEEECE1, 0x4F81BD,
                                                       0xC0504D, 0x9BBB59, 0x8064A2, 0x4BACC6, 0xF79646};
    if (!theme_.empty())
        return theme_;
    try {
        theme_ = ReadThemeColors(ThemeFile());
    } catch (const RaisedError&) {
        theme_.clear(); // a damaged file of properties costs its colours, no more
    }
    if (theme_.empty())
        theme_ = kOffice;
    return theme_;
}

} // namespace tovimar::platform::access
