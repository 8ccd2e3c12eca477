#pragma once

#include "platform/access/DataModel.h"
#include "platform/access/Design.h"
#include "platform/access/OpenObject.h"

#include <string>
#include <vector>

/// Reads .mdb and .accdb files. The reader library trusts its input, so it works in a child process with
/// bounded time and memory: whatever a damaged file does to it ends as an error here.
namespace tovimar::platform::access {

/// A form, report, macro or module, of which the design isn't read.
struct NamedObject {
    ObjectKind kind = ObjectKind::Form;
    std::string name;
    NamedTexts properties; ///< "Description" and the like
};

struct DatabaseContent {
    std::vector<TableDefinition> tables; ///< user tables and linked ones
    std::vector<QueryDefinition> queries;
    std::vector<RelationDefinition> relations;
    std::vector<NamedObject> names;
};

/// Raises 0x80040001 "<path>: <reason>" for a file that can't be read as a database.
DatabaseContent ReadDatabase(const std::string& nativePath);

/// How a field's content shows to a reader.
Records::Type RecordType(FieldType type);

/// Columns and the first records of a table; raises as ReadDatabase, and when the table is absent.
Records ReadTableRecords(const std::string& nativePath, const std::string& table, int rows);

} // namespace tovimar::platform::access
