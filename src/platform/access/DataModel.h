#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

/// Tables, queries and relations as the sources give them.
namespace tovimar::platform::access {

/// The data access library's numbers.
enum class FieldType : std::int32_t {
    Boolean = 1,
    Byte = 2,
    Integer = 3,
    Long = 4,
    Currency = 5,
    Single = 6,
    Double = 7,
    Date = 8,
    Binary = 9,
    Text = 10,
    LongBinary = 11,
    Memo = 12,
    Guid = 15,
    BigInt = 16,
    Decimal = 20,
    Attachment = 101
};

using NamedTexts = std::vector<std::pair<std::string, std::string>>;
/// None when the name, compared without regard to case, is absent.
std::optional<std::string> FindNamedText(const NamedTexts& texts, std::string_view name);

struct FieldDefinition {
    std::string name;
    FieldType type = FieldType::Text;
    std::int32_t size = 0; ///< bytes or characters, 0 where it isn't told
    bool autoNumber = false;
    bool required = false;
    bool inPrimaryKey = false;
    /// Where a query's field comes from; both empty for a calculated field.
    std::string sourceField, sourceTable;
    NamedTexts properties; ///< "Description", "Caption", "Format", ...
};

struct IndexDefinition {
    std::string name;
    bool primary = false;
    bool unique = false;
    std::vector<std::string> fields;
};

struct TableDefinition {
    std::string name;
    std::vector<FieldDefinition> fields;
    std::vector<IndexDefinition> indexes;
    std::string connect;     ///< empty for a local table
    std::string sourceTable; ///< of a linked table
    std::int32_t attributes = 0;
    NamedTexts properties;
};

/// A query as its design grid has it. For a query known by its statement alone, `sql` is parsed.
struct QueryDefinition {
    struct Input {
        std::string table;          ///< table or query, or "" for a nested statement
        std::string alias;          ///< the table's name where none is given
        std::string statement = {}; ///< the nested one, where the source has it apart
    };
    struct Column {
        std::string expression; ///< "Orders.Total", "Orders.*", "[a]+[b]"; of an update the field
        std::string alias;
        std::string target = {}; ///< an append's field of the target; an update's new value
        int role = 0;            ///< in a crosstab: 0 value, 1 column heading, 2 row heading
    };
    /// Conditions as they are written; an outer join keeps records without a partner.
    struct Join {
        std::string condition;
        bool outer = false;
        std::string left = {}; ///< alias; empty where the source tells only the condition
        std::string right = {};
        bool keepsRight = false; ///< of an outer one: the records of the right side, not of the left
    };
    struct Parameter {
        std::string name;
        int type = 0; ///< the data library's number
    };
    struct Sort {
        std::string expression;
        bool descending = false;
    };
    std::string name;
    /// 1 select, 2 make-table, 3 append, 4 update, 5 delete, 6 crosstab, 7 data definition,
    /// 8 pass-through, 9 union.
    int operation = 1;
    std::string sql; ///< empty where the source has only the grid
    std::vector<Input> inputs;
    std::vector<Column> columns;
    bool allFields = false; ///< every field of every input as well
    std::vector<Join> joins;
    std::string where; ///< empty for none
    std::vector<std::string> groups;
    std::string having;
    std::vector<Sort> sorts;
    bool distinct = false;    ///< equal records count once
    bool distinctRow = false; ///< records of the tables, not of the fields, count once
    int top = 0;              ///< records at most, 0 for all
    bool topPercent = false;
    std::string target;     ///< table that a make-table or append query writes to
    std::string targetFile; ///< database of the target; empty for this one
    std::vector<Parameter> parameters;
    NamedTexts properties;
};

struct RelationDefinition {
    std::string name, table, foreignTable;
    std::int32_t attributes = 0;                             ///< bit 1: one to one
    std::vector<std::pair<std::string, std::string>> fields; ///< name, foreign name
};

} // namespace tovimar::platform::access
