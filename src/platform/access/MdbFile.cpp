#include "platform/access/MdbFile.h"

#include "platform/Error.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <fstream>
#include <mdbtools.h>
#include <unordered_map>

namespace tovimar::platform::access {

namespace {

constexpr int kMaxPropertyObjects = 10000;
/// Longer memo texts are cut: statements of queries reach 64 KB.
constexpr std::size_t kMaxCell = 200000;

/// The newer formats tell on their first page how they are encrypted; it isn't filled otherwise.
void CheckEncryption(const std::string& nativePath, std::ifstream& file) {
    constexpr std::streamoff kFormat = 0x14;
    constexpr std::streamoff kEncryptionLength = 0x299;
    std::array<char, 3> bytes{};
    file.seekg(kFormat);
    file.read(bytes.data(), 1);
    file.seekg(kEncryptionLength);
    file.read(bytes.data() + 1, 2);
    if (file && bytes[0] >= 2 && (bytes[1] != 0 || bytes[2] != 0))
        throw RaisedError(kFailure1,
                          nativePath +
                              ": the database is encrypted with a password, so nothing in it can be read; "
                              "save it without one to document it.",
                          "DatabaseReader");
}

void CheckSignature(const std::string& nativePath) {
    std::array<char, 19> start{};
    std::ifstream file(nativePath, std::ios::binary);
    if (!file)
        throw RaisedError(kFailure1, nativePath + ": the file can't be opened.", "DatabaseReader");
    file.read(start.data(), static_cast<std::streamsize>(start.size()));
    const std::string_view signature(start.data() + 4, 15);
    const bool known = signature == "Standard Jet DB" || signature == "Standard ACE DB";
    file.seekg(0, std::ios::end);
    if (!known || start[1] != 1 || file.tellg() < 3 * 2048)
        throw RaisedError(kFailure1, nativePath + ": the file is no Access database.", "DatabaseReader");
    CheckEncryption(nativePath, file);
}

FieldType TypeOf(int columnType) {
    switch (columnType) {
    case MDB_REPID:
        return FieldType::Guid;
    case MDB_NUMERIC:
        return FieldType::Decimal;
    case MDB_COMPLEX:
        return FieldType::Attachment;
    default:
        return columnType >= MDB_BOOL && columnType <= MDB_MEMO ? static_cast<FieldType>(columnType)
                                                                : FieldType::Binary;
    }
}

MdbColumn* ColumnAt(const MdbTableDef* table, unsigned int index) {
    return static_cast<MdbColumn*>(g_ptr_array_index(table->columns, index));
}

void CopyText(gpointer key, gpointer value, gpointer texts) {
    static_cast<NamedTexts*>(texts)->emplace_back(static_cast<const char*>(key),
                                                  static_cast<const char*>(value));
}

NamedTexts CopyTexts(const MdbProperties* properties) {
    NamedTexts texts;
    if (properties && properties->hash)
        g_hash_table_foreach(properties->hash, CopyText, &texts);
    std::sort(texts.begin(), texts.end()); // the library's order is that of its hash
    return texts;
}

FieldDefinition ReadField(const MdbTableDef* table, unsigned int index) {
    const auto* column = ColumnAt(table, index);
    FieldDefinition field;
    field.name = text::MakeValidUtf8(column->name);
    field.type = TypeOf(column->col_type);
    const bool twoBytes = table->entry->mdb->f->jet_version != MDB_VER_JET3;
    field.size = column->col_type == MDB_TEXT && twoBytes ? column->col_size / 2 : column->col_size;
    field.autoNumber = column->is_long_auto != 0 || column->is_uuid_auto != 0;
    field.properties = CopyTexts(column->props);
    return field;
}

void ReadIndexes(MdbTableDef* source, TableDefinition& table) {
    constexpr unsigned char kPrimary = 1;
    mdb_read_indices(source);
    for (guint i = 0; source->indices && i < source->indices->len; ++i) {
        const auto* index = static_cast<MdbIndex*>(g_ptr_array_index(source->indices, i));
        IndexDefinition read;
        read.name = text::MakeValidUtf8(index->name);
        read.primary = index->index_type == kPrimary;
        read.unique = read.primary || (index->flags & MDB_IDX_UNIQUE) != 0;
        for (unsigned int key = 0; key < std::min(index->num_keys, unsigned{MDB_MAX_IDX_COLS}); ++key) {
            const auto column = static_cast<std::size_t>(index->key_col_num[key]) - 1;
            if (column >= table.fields.size())
                continue;
            read.fields.push_back(table.fields[column].name);
            table.fields[column].inPrimaryKey = table.fields[column].inPrimaryKey || read.primary;
        }
        table.indexes.push_back(std::move(read));
    }
}

} // namespace

MdbTable::MdbTable(MdbTableDef* table) : table_(table) {}

MdbTable::~MdbTable() {
    mdb_free_tabledef(table_);
}

TableDefinition MdbTable::Definition() const {
    TableDefinition table;
    table.name = text::MakeValidUtf8(table_->name);
    table.properties = CopyTexts(table_->props);
    for (unsigned int i = 0; i < table_->num_cols; ++i)
        table.fields.push_back(ReadField(table_, i));
    ReadIndexes(table_, table);
    return table;
}

std::vector<std::string> MdbTable::ColumnNames() const {
    std::vector<std::string> names;
    for (unsigned int i = 0; i < table_->num_cols; ++i)
        names.push_back(text::MakeValidUtf8(ColumnAt(table_, i)->name));
    return names;
}

void MdbTable::ForEachRow(const std::function<bool(const std::vector<std::string>& cells)>& row) {
    const auto count = table_->num_cols;
    std::vector<std::string> buffers(count, std::string(kMaxCell + 1, '\0'));
    std::vector<int> lengths(count, 0);
    for (unsigned int i = 0; i < count; ++i)
        mdb_bind_column(table_, static_cast<int>(i) + 1, buffers[i].data(), &lengths[i]);
    mdb_rewind_table(table_);
    std::vector<std::string> cells(count);
    while (mdb_fetch_row(table_)) {
        for (unsigned int i = 0; i < count; ++i)
            cells[i] = lengths[i] > 0 ? text::MakeValidUtf8(buffers[i].c_str()) : std::string();
        if (!row(cells))
            return;
    }
}

std::string MdbTable::LongValue(unsigned int column, std::size_t most) const {
    auto* source = ColumnAt(table_, column);
    auto* mdb = table_->entry->mdb;
    std::string place(static_cast<const char*>(source->bind_ptr), MDB_MEMO_OVERHEAD);
    std::string value;
    auto length = mdb_ole_read(mdb, source, place.data(), MDB_BIND_SIZE);
    while (length > 0 && value.size() < most) {
        value.append(static_cast<const char*>(source->bind_ptr), length);
        length = mdb_ole_read_next(mdb, source, place.data());
    }
    return value;
}

void MdbTable::ForEachRawRow(std::size_t most,
                             const std::function<bool(const std::vector<std::string>& cells)>& row) {
    const auto count = table_->num_cols;
    std::vector<std::string> buffers(count, std::string(kMaxCell + 1, '\0'));
    for (unsigned int i = 0; i < count; ++i)
        mdb_bind_column(table_, static_cast<int>(i) + 1, buffers[i].data(), nullptr);
    mdb_rewind_table(table_);
    const auto* mdb = table_->entry->mdb;
    std::vector<std::string> cells(count);
    while (mdb_fetch_row(table_)) {
        // Reading a long value takes the page from under the other cells: they come first.
        for (unsigned int i = 0; i < count; ++i) {
            const auto* column = ColumnAt(table_, i);
            const auto start = static_cast<std::size_t>(column->cur_value_start);
            const auto length = static_cast<std::size_t>(column->cur_value_len);
            const bool inside = start <= sizeof mdb->pg_buf && length <= sizeof mdb->pg_buf - start;
            cells[i] = inside ? std::string(reinterpret_cast<const char*>(mdb->pg_buf) + start, length)
                              : std::string();
        }
        for (unsigned int i = 0; i < count; ++i)
            if (const auto type = ColumnAt(table_, i)->col_type; type == MDB_OLE || type == MDB_MEMO)
                cells[i] = cells[i].empty() ? std::string() : LongValue(i, most);
        if (!row(cells))
            return;
    }
}

struct MdbFile::Handle {
    MdbHandle* mdb = nullptr;
    /// Names may be cut inside of a character; they are compared as the library gives them.
    std::unordered_multimap<std::string, MdbCatalogEntry*> entries;
};

MdbFile::MdbFile(const std::string& nativePath) : handle_(std::make_unique<Handle>()) {
    CheckSignature(nativePath);
    handle_->mdb = mdb_open(nativePath.c_str(), MDB_NOFLAGS);
    if (handle_->mdb && !mdb_read_catalog(handle_->mdb, MDB_ANY)) {
        mdb_close(handle_->mdb);
        handle_->mdb = nullptr;
    }
    if (!handle_->mdb)
        throw RaisedError(kFailure1,
                          nativePath + ": the database can't be read; it may be damaged or encrypted.",
                          "DatabaseReader");
    for (guint i = 0; i < handle_->mdb->catalog->len; ++i) {
        auto* entry = static_cast<MdbCatalogEntry*>(g_ptr_array_index(handle_->mdb->catalog, i));
        handle_->entries.emplace(text::MakeValidUtf8(entry->object_name), entry);
    }
    mdb_set_bind_size(handle_->mdb, kMaxCell);
    mdb_set_date_fmt(handle_->mdb, "%Y-%m-%d %H:%M:%S");
    mdb_set_shortdate_fmt(handle_->mdb, "%Y-%m-%d");
}

MdbFile::~MdbFile() {
    mdb_close(handle_->mdb);
}

std::vector<std::string> MdbFile::TableNames() const {
    std::vector<std::string> names;
    for (guint i = 0; i < handle_->mdb->catalog->len; ++i) {
        const auto* entry = static_cast<MdbCatalogEntry*>(g_ptr_array_index(handle_->mdb->catalog, i));
        if (entry->object_type == MDB_TABLE)
            names.push_back(text::MakeValidUtf8(entry->object_name));
    }
    return names;
}

std::unique_ptr<MdbTable> MdbFile::OpenTable(const std::string& name) {
    const auto [first, last] = handle_->entries.equal_range(name);
    const auto found =
        std::find_if(first, last, [](const auto& named) { return named.second->object_type == MDB_TABLE; });
    auto* table = found == last ? nullptr : mdb_read_table(found->second);
    if (!table)
        return nullptr;
    if (!mdb_read_columns(table) || table->columns->len < table->num_cols) {
        mdb_free_tabledef(table);
        return nullptr;
    }
    return std::unique_ptr<MdbTable>(new MdbTable(table));
}

ObjectProperties MdbFile::Properties(const std::string& name) const {
    ObjectProperties read;
    const auto [first, last] = handle_->entries.equal_range(name);
    for (auto named = first; named != last; ++named) {
        const auto* entry = named->second;
        if (!entry->props)
            continue;
        for (guint k = 0; k < std::min<guint>(entry->props->len, kMaxPropertyObjects); ++k) {
            const auto* properties = static_cast<MdbProperties*>(g_ptr_array_index(entry->props, k));
            const std::string owner = properties->name ? properties->name : "";
            if (owner.empty())
                read.own = CopyTexts(properties);
            else
                read.fields.emplace_back(text::MakeValidUtf8(owner), CopyTexts(properties));
        }
    }
    return read;
}

} // namespace tovimar::platform::access
