#include "platform/access/ExportReader.h"
#include "platform/access/QueryReader.h"
#include "platform/text/Text.h"

namespace tovimar::platform::access {

namespace {

const std::string* FindText(const DesignObject& object, std::string_view property) {
    const auto* value = object.FindOwn(property);
    return value ? &value->text : nullptr;
}

/// "Name" opens a table, "Alias" behind it names it within the query.
void ReadInputTables(const DesignObject& block, QueryDefinition& query) {
    for (const auto& [name, value] : block.properties) {
        if (text::EqualsIgnoringCase(name, "Name"))
            query.inputs.push_back({value.text, value.text});
        else if (text::EqualsIgnoringCase(name, "Alias") && !query.inputs.empty())
            query.inputs.back().alias = value.text;
    }
}

/// "Alias" or "Name" stand in front of the "Expression" that they name.
void ReadOutputColumns(const DesignObject& block, QueryDefinition& query) {
    QueryDefinition::Column column;
    for (const auto& [name, value] : block.properties) {
        if (text::EqualsIgnoringCase(name, "Alias")) {
            column.alias = value.text;
        } else if (text::EqualsIgnoringCase(name, "Expression")) {
            column.expression = value.text;
            query.columns.push_back(std::move(column));
            column = {};
        }
    }
}

/// One condition each; flag 1 keeps only records with a partner.
void ReadJoins(const DesignObject& block, QueryDefinition& query) {
    for (const auto& [name, value] : block.properties) {
        if (text::EqualsIgnoringCase(name, "Expression"))
            query.joins.push_back({value.text, false});
        else if (text::EqualsIgnoringCase(name, "Flag") && !query.joins.empty())
            query.joins.back().outer = value.text != "1";
    }
}

/// Flag 1 is the falling order.
void ReadSorts(const DesignObject& block, QueryDefinition& query) {
    for (const auto& [name, value] : block.properties) {
        if (text::EqualsIgnoringCase(name, "Expression"))
            query.sorts.push_back({value.text, false});
        else if (text::EqualsIgnoringCase(name, "Flag") && !query.sorts.empty())
            query.sorts.back().descending = value.text == "1";
    }
}

QueryDefinition ReadGrid(const DesignObject& root) {
    constexpr int kAllFields = 1, kDistinct = 2 | 8;
    QueryDefinition query;
    query.operation = root.Integer("Operation", 1);
    const int option = root.Integer("Option");
    query.allFields = (option & kAllFields) != 0;
    query.distinct = (option & kDistinct) != 0;
    query.where = root.FindOwn("Where") ? root.Text("Where") : std::string();
    for (const auto& block : root.children) {
        if (block->Is("InputTables"))
            ReadInputTables(*block, query);
        else if (block->Is("OutputColumns"))
            ReadOutputColumns(*block, query);
        else if (block->Is("Joins"))
            ReadJoins(*block, query);
        else if (block->Is("OrderBy"))
            ReadSorts(*block, query);
        else if (block->Is("Groups"))
            for (const auto& [name, value] : block->properties)
                if (text::EqualsIgnoringCase(name, "Expression"))
                    query.groups.push_back(value.text);
    }
    return query;
}

} // namespace

QueryDefinition ReadQueryExport(std::string_view source, const std::string& nativePath) {
    const auto tree = ParseExportTree(source, nativePath);
    const auto* sql = FindText(*tree.root, "SQL");
    auto query = sql ? ParseQuerySql(*sql) : ReadGrid(*tree.root);
    if (const auto* connect = FindText(*tree.root, "Connect"); connect && !connect->empty())
        query.operation = 8;
    for (const auto* property : {"Description", "Caption"})
        if (const auto* value = FindText(*tree.root, property))
            query.properties.emplace_back(property, *value);
    return query;
}

} // namespace tovimar::platform::access
