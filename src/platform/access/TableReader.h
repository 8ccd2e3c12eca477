#pragma once

#include "platform/access/DataModel.h"
#include "platform/access/OpenObject.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// Tables, relations and data from the text files of an export folder. What a text doesn't hold stays
/// empty; a JSON or XML text that can't be read raises 0x80040001 "<file>: <reason>".
namespace tovimar::platform::access {

/// CREATE TABLE and CREATE INDEX statements. A statement without a name gets `name`.
TableDefinition ReadTableSql(std::string_view text, const std::string& name);

/// The XML schema beside a table's statement: real names, types, descriptions and captions, merged into
/// the definition.
void MergeTableSchema(std::string_view xml, const std::string& nativePath, TableDefinition& table);

/// A linked table's JSON text: connection, source and properties.
TableDefinition ReadLinkedTable(std::string_view json, const std::string& name,
                                const std::string& nativePath);

/// Properties of the query in the JSON text beside its statement, its description among them.
NamedTexts ReadQueryInfo(std::string_view json, const std::string& nativePath);

/// Properties of named objects: container ("Forms", "Scripts", ...), object, properties.
struct DocumentInfo {
    std::string container, name;
    NamedTexts properties;
};
std::vector<DocumentInfo> ReadDocuments(std::string_view json, const std::string& nativePath);

/// A relation as JSON, or as lines: attributes, name, table, foreign table, and per field
/// "Field = Begin", name, foreign name, "End".
RelationDefinition ReadRelation(std::string_view text, const std::string& nativePath);

/// The first records of a table's data: lines with tabs between the cells, or XML.
Records ReadTableData(std::string_view text, const std::string& nativePath, int rows);

/// Text at a path of keys in a JSON text: JsonText(text, file, {"Items", "Name"}); empty when absent.
std::string JsonText(std::string_view json, const std::string& nativePath,
                     std::initializer_list<const char*> keys);

/// "_x0027_" stands for a character that an XML name can't hold.
std::string DecodeXmlName(std::string_view name);

} // namespace tovimar::platform::access
