#include "platform/access/DatabaseJson.h"

#include "platform/Error.h"

#include <nlohmann/json.hpp>

namespace tovimar::platform::access {

NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(FieldDefinition, name, type, size, autoNumber, required, inPrimaryKey,
                                   sourceField, sourceTable, properties)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(IndexDefinition, name, primary, unique, fields)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(TableDefinition, name, fields, indexes, connect, sourceTable, attributes,
                                   properties)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(QueryDefinition::Input, table, alias, statement)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(QueryDefinition::Column, expression, alias, target, role)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(QueryDefinition::Join, condition, outer, left, right, keepsRight)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(QueryDefinition::Parameter, name, type)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(QueryDefinition::Sort, expression, descending)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(QueryDefinition, name, operation, sql, inputs, columns, allFields, joins,
                                   where, groups, sorts, distinct, top, properties, having, distinctRow,
                                   topPercent, target, targetFile, parameters)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(RelationDefinition, name, table, foreignTable, attributes, fields)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(NamedObject, kind, name, properties)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(DatabaseContent, tables, queries, relations, names)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(Records::Column, name, type)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(Records, columns, rows)

namespace {

using Json = nlohmann::json;

template <typename T> std::string ToJson(const T& value) {
    return Json(value).dump(-1, ' ', false, Json::error_handler_t::replace);
}

template <typename T> T FromJson(const std::string& bytes) {
    try {
        return Json::parse(bytes).get<T>();
    } catch (const Json::exception& failure) {
        throw RaisedError(kFailure1, std::string("The database can't be read: ") + failure.what(),
                          "DatabaseReader");
    }
}

} // namespace

std::string ContentToJson(const DatabaseContent& content) {
    return ToJson(content);
}

DatabaseContent ContentFromJson(const std::string& bytes) {
    return FromJson<DatabaseContent>(bytes);
}

std::string RecordsToJson(const Records& records) {
    return ToJson(records);
}

Records RecordsFromJson(const std::string& bytes) {
    return FromJson<Records>(bytes);
}

} // namespace tovimar::platform::access
