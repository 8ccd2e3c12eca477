#pragma once

#include "platform/access/DataModel.h"
#include "platform/access/OpenObject.h"

#include <functional>
#include <optional>
#include <string>

/// Runs queries as far as pictures need their records.
namespace tovimar::platform::access {

/// Records of a table or query by its name; null for what can't be had.
using RecordSource = std::function<const Records*(const std::string&)>;

/// The first `rows` records of a query that selects: joins on equal fields, conditions, groups, order.
/// A condition that can't be worked out (a question to the user, a function of the application's own)
/// is taken to hold. A column that can't be worked out is of type Unknown and empty. None when a
/// source is missing or the query doesn't select.
std::optional<Records> RunQuery(const QueryDefinition& query, const RecordSource& source, int rows);

} // namespace tovimar::platform::access
