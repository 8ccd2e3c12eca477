#include "platform/access/DatabaseReader.h"

#include "platform/Error.h"
#include "platform/access/DatabaseJson.h"
#include "platform/access/GuardedWork.h"
#include "platform/access/MdbFile.h"
#include "platform/access/QueryReader.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <charconv>
#include <map>

namespace tovimar::platform::access {

namespace {

/// Object types of the system catalogue.
constexpr int kTable = 1;
constexpr int kLinkedOdbc = 4;
constexpr int kQuery = 5;
constexpr int kLinked = 6;
/// Tables of the system and those behind multi-value fields.
constexpr std::uint32_t kSystemFlags = 0x80000002U;

constexpr std::size_t kMaxRows = 100000;

std::int64_t ToNumber(const std::string& digits) {
    std::int64_t number = 0;
    std::from_chars(digits.data(), digits.data() + digits.size(), number);
    return number;
}

/// Rows of a system table by column name. They are all read first: the library has one page buffer, and
/// opening another table would take it away from under the rows.
class SystemRows {
public:
    SystemRows(MdbFile& file, const std::string& table) {
        const auto source = file.OpenTable(table);
        if (!source)
            return;
        for (const auto& name : source->ColumnNames())
            columns_.emplace(name, columns_.size());
        source->ForEachRow([&](const std::vector<std::string>& cells) {
            rows_.push_back(cells);
            return rows_.size() < kMaxRows;
        });
    }
    std::size_t Count() const { return rows_.size(); }
    std::string Text(std::size_t row, const std::string& column) const {
        const auto found = columns_.find(column);
        return found == columns_.end() ? std::string() : rows_[row][found->second];
    }

private:
    std::map<std::string, std::size_t> columns_;
    std::vector<std::vector<std::string>> rows_;
};

class NamedRow {
public:
    NamedRow(const SystemRows& rows, std::size_t row) : rows_(rows), row_(row) {}
    std::string Text(const std::string& column) const { return rows_.Text(row_, column); }
    std::int64_t Number(const std::string& column) const { return ToNumber(Text(column)); }

private:
    const SystemRows& rows_;
    std::size_t row_;
};

void ForEachRow(MdbFile& file, const std::string& table, const std::function<void(const NamedRow&)>& take) {
    const SystemRows rows(file, table);
    for (std::size_t i = 0; i < rows.Count(); ++i)
        take(NamedRow(rows, i));
}

bool IsHiddenName(std::string_view name) {
    return name.empty() || name.starts_with('~') || text::StartsWithIgnoringCase(name, "MSys");
}

class ContentReader {
public:
    explicit ContentReader(const std::string& nativePath) : file_(nativePath) {}

    DatabaseContent Run() {
        ForEachRow(file_, "MSysObjects", [this](const NamedRow& row) { TakeObject(row); });
        ForEachRow(file_, "MSysQueries", [this](const NamedRow& row) { TakeQueryRow(row); });
        ForEachRow(file_, "MSysRelationships", [this](const NamedRow& row) { TakeRelationRow(row); });
        for (auto& [id, query] : queries_)
            content_.queries.push_back(std::move(query));
        return std::move(content_);
    }

private:
    void TakeObject(const NamedRow& row) {
        const auto name = row.Text("Name");
        if (IsHiddenName(name))
            return;
        const auto type = static_cast<std::int16_t>(row.Number("Type"));
        if (type == kTable && (static_cast<std::uint32_t>(row.Number("Flags")) & kSystemFlags) == 0)
            TakeTable(name);
        else if (type == kLinked || type == kLinkedOdbc)
            TakeLinkedTable(name, row);
        else if (type == kQuery)
            TakeQuery(name, row.Number("Id"));
        else
            TakeName(name, type);
    }

    void TakeTable(const std::string& name) {
        TableDefinition table;
        table.name = name;
        if (const auto source = file_.OpenTable(name))
            table = source->Definition();
        table.name = name;
        // The host keeps the versions of a memo field in a field of its own, which it never shows.
        std::erase_if(table.fields, [](const FieldDefinition& field) {
            return field.type == FieldType::Attachment && field.name.starts_with("VersionHistory_");
        });
        const auto properties = file_.Properties(name);
        table.properties = properties.own;
        for (auto& field : table.fields) {
            for (const auto& [owner, texts] : properties.fields)
                if (text::EqualsIgnoringCase(owner, field.name))
                    field.properties = texts;
            field.required = FindNamedText(field.properties, "Required").value_or("no") == "yes";
        }
        content_.tables.push_back(std::move(table));
    }

    void TakeLinkedTable(const std::string& name, const NamedRow& row) {
        TableDefinition table;
        table.name = name;
        table.connect = row.Text("Connect") + ";DATABASE=" + row.Text("Database");
        table.sourceTable = row.Text("ForeignName");
        table.attributes = 0x40000000;
        table.properties = file_.Properties(name).own;
        content_.tables.push_back(std::move(table));
    }

    void TakeQuery(const std::string& name, std::int64_t id) {
        auto& query = queries_[id];
        query.name = name;
        query.properties = file_.Properties(name).own;
    }

    void TakeName(const std::string& name, std::int16_t type) {
        static const std::map<int, ObjectKind> kKinds = {{-32768, ObjectKind::Form},
                                                         {-32764, ObjectKind::Report},
                                                         {-32766, ObjectKind::Macro},
                                                         {-32761, ObjectKind::Module}};
        if (const auto kind = kKinds.find(type); kind != kKinds.end())
            content_.names.push_back({kind->second, name, file_.Properties(name).own});
    }

    /// One row per part of a query's design; the attribute tells which part.
    void TakeQueryRow(const NamedRow& row) {
        const auto found = queries_.find(row.Number("ObjectId"));
        if (found == queries_.end())
            return;
        auto& query = found->second;
        const auto expression = row.Text("Expression");
        const auto first = row.Text("Name1");
        switch (row.Number("Attribute")) {
        case 1:
            query.operation = static_cast<int>(row.Number("Flag"));
            query.target = first;
            query.targetFile = row.Text("Name2");
            if (query.operation >= 7)
                query.sql = expression;
            break;
        case 2:
            query.parameters.push_back({first, static_cast<int>(row.Number("Flag"))});
            break;
        case 3:
            TakeQueryOptions(query, row.Number("Flag"), first);
            break;
        case 5:
            TakeQueryInput(query, expression, first, row.Text("Name2"));
            break;
        case 6:
            // An update's field stands behind its new value.
            if (query.operation == 4)
                query.columns.push_back({row.Text("Name2"), first, expression});
            else
                query.columns.push_back(
                    {expression, first, row.Text("Name2"), static_cast<int>(row.Number("Flag"))});
            break;
        case 7:
            query.joins.push_back(
                {expression, row.Number("Flag") != 1, first, row.Text("Name2"), row.Number("Flag") == 3});
            break;
        case 8:
            query.where = expression;
            break;
        case 9:
            query.groups.push_back(expression);
            break;
        case 10:
            query.having = expression;
            break;
        case 11:
            query.sorts.push_back({expression, text::StartsWithIgnoringCase(first, "D")});
            break;
        default:
            break;
        }
    }

    static void TakeQueryOptions(QueryDefinition& query, std::int64_t flags, const std::string& top) {
        query.allFields = (flags & 1) != 0;
        query.distinct = (flags & 2) != 0;
        query.distinctRow = (flags & 8) != 0;
        query.top =
            (flags & 16) != 0 ? static_cast<int>(std::clamp<std::int64_t>(ToNumber(top), 0, 1000000000)) : 0;
        query.topPercent = (flags & 32) != 0;
    }

    /// A union's parts stand as whole statements; the first one names the fields.
    static void TakeQueryInput(QueryDefinition& query, const std::string& expression,
                               const std::string& table, const std::string& alias) {
        if (query.operation == 9 && table.empty()) {
            query.sql += (query.sql.empty() ? "" : "\r\nUNION ") + expression;
            return;
        }
        query.inputs.push_back({table, alias.empty() ? table : alias, table.empty() ? expression : ""});
    }

    void TakeRelationRow(const NamedRow& row) {
        const auto name = row.Text("szRelationship");
        const auto table = row.Text("szReferencedObject");
        const auto foreignTable = row.Text("szObject");
        if (IsHiddenName(table) || IsHiddenName(foreignTable))
            return;
        auto& relations = content_.relations;
        auto found = std::find_if(relations.begin(), relations.end(),
                                  [&](const RelationDefinition& relation) { return relation.name == name; });
        if (found == relations.end()) {
            const auto attributes = static_cast<std::int32_t>(row.Number("grbit"));
            relations.push_back({name, table, foreignTable, attributes, {}});
            found = std::prev(relations.end());
        }
        found->fields.emplace_back(row.Text("szReferencedColumn"), row.Text("szColumn"));
    }

    MdbFile file_;
    DatabaseContent content_;
    std::map<std::int64_t, QueryDefinition> queries_;
};

/// A query whose statement is known in whole is read from it, the others get one from their grid.
void CompleteQuery(QueryDefinition& query) {
    if (query.sql.empty())
        query.sql = QueryStatement(query);
    if (query.operation != 9)
        return;
    auto parsed = ParseQuerySql(query.sql);
    query.inputs = std::move(parsed.inputs);
    query.columns = std::move(parsed.columns);
    query.joins = std::move(parsed.joins);
    query.where = std::move(parsed.where);
}

} // namespace

DatabaseContent ReadDatabase(const std::string& nativePath) {
    auto content = ContentFromJson(
        RunGuarded(nativePath, [&] { return ContentToJson(ContentReader(nativePath).Run()); }));
    for (auto& query : content.queries)
        CompleteQuery(query);
    return content;
}

} // namespace tovimar::platform::access
