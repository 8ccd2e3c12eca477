#pragma once

#include "platform/access/DataModel.h"

#include <functional>
#include <string>
#include <string_view>
#include <vector>

/// Queries from their statements and exports, and where their fields come from.
namespace tovimar::platform::access {

/// Reads a statement as far as its fields and tables go. Anything that isn't understood leaves the lists
/// short; nothing is raised.
QueryDefinition ParseQuerySql(std::string_view sql);

/// Reads the text export of a query. Raises as ParseExportTree.
QueryDefinition ReadQueryExport(std::string_view text, const std::string& nativePath);

/// The statement for a grid, as the host writes it: a clause a line, ended by a semicolon. Empty for a query
/// without a grid.
std::string QueryStatement(const QueryDefinition& query);

/// Looks tables and queries up by name; null for a name that isn't known.
struct FieldSources {
    std::function<const TableDefinition*(const std::string&)> table;
    std::function<const QueryDefinition*(const std::string&)> query;
};

/// The query's fields: names as the host makes them, source field and table down to the base table, types
/// where the table is known. Queries that lead to themselves end at the repetition.
std::vector<FieldDefinition> ResolveQueryFields(const QueryDefinition& query, const FieldSources& sources);

} // namespace tovimar::platform::access
