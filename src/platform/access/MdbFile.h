#pragma once

#include "platform/access/DataModel.h"

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

typedef struct S_MdbTableDef MdbTableDef;

/// The reader library behind owning types. Only used inside of RunGuarded.
namespace tovimar::platform::access {

/// Object-level and field-level properties of one catalogue entry.
struct ObjectProperties {
    NamedTexts own;
    std::vector<std::pair<std::string, NamedTexts>> fields;
};

class MdbTable {
public:
    ~MdbTable();
    MdbTable(const MdbTable&) = delete;
    MdbTable& operator=(const MdbTable&) = delete;

    TableDefinition Definition() const;
    /// Calls `row` with the cells' texts, in the order of the columns, until it answers false.
    void ForEachRow(const std::function<bool(const std::vector<std::string>& cells)>& row);
    /// The same with the bytes as they are kept: numbers in their own form, long values whole, but for what
    /// is behind `most` bytes of a cell.
    void ForEachRawRow(std::size_t most,
                       const std::function<bool(const std::vector<std::string>& cells)>& row);
    std::vector<std::string> ColumnNames() const;

private:
    friend class MdbFile;
    explicit MdbTable(MdbTableDef* table);
    std::string LongValue(unsigned int column, std::size_t most) const;
    MdbTableDef* table_; ///< owned
};

class MdbFile {
public:
    /// Raises 0x80040001 with the native path for a file that isn't a database.
    explicit MdbFile(const std::string& nativePath);
    ~MdbFile();
    MdbFile(const MdbFile&) = delete;
    MdbFile& operator=(const MdbFile&) = delete;

    std::vector<std::string> TableNames() const;
    /// Null when the table is absent or its definition can't be read.
    std::unique_ptr<MdbTable> OpenTable(const std::string& name);
    /// Properties of the object of that name, "Description" and the like.
    ObjectProperties Properties(const std::string& name) const;

private:
    struct Handle;
    std::unique_ptr<Handle> handle_;
};

} // namespace tovimar::platform::access
