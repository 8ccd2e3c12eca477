#include "platform/access/database/StorageReader.h"

#include "platform/access/GuardedWork.h"
#include "platform/access/MdbFile.h"
#include "platform/access/database/Bytes.h"
#include "platform/access/database/CompoundFile.h"

#include <map>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kLongestStream = std::size_t{64} << 20U;
constexpr std::size_t kMostNodes = 100000;
constexpr char kFolderType = 1;

/// Columns by name.
class RawRows {
public:
    RawRows(MdbFile& file, const char* table) : table_(file.OpenTable(table)) {
        if (!table_)
            return;
        for (const auto& name : table_->ColumnNames())
            columns_.emplace(name, columns_.size());
    }
    template <class Take> void ForEach(const Take& take) {
        if (table_)
            table_->ForEachRawRow(kLongestStream, [&](const std::vector<std::string>& cells) {
                cells_ = &cells;
                return take(*this);
            });
    }
    std::string_view Bytes(const char* column) const {
        const auto found = columns_.find(column);
        return found == columns_.end() ? std::string_view() : std::string_view((*cells_)[found->second]);
    }
    std::int32_t Number(const char* column) const {
        std::uint32_t number = 0;
        const auto bytes = Bytes(column).substr(0, 4);
        for (std::size_t i = bytes.size(); i-- > 0;)
            number = number << 8U | static_cast<std::uint8_t>(bytes[i]);
        return static_cast<std::int32_t>(number);
    }

private:
    std::unique_ptr<MdbTable> table_;
    std::map<std::string, std::size_t> columns_;
    const std::vector<std::string>* cells_ = nullptr;
};

void AppendNumber(std::string& out, std::size_t number) {
    for (unsigned bits = 0; bits < 32; bits += 8)
        out += static_cast<char>(number >> bits & 0xFFU);
}

/// One node: id, parent, type, lengths of name and bytes, both.
void AppendNode(std::string& out, const RawRows& row) {
    const auto bytes = row.Bytes("Lv");
    const auto name = row.Bytes("Name");
    AppendNumber(out, static_cast<std::uint32_t>(row.Number("Id")));
    AppendNumber(out, static_cast<std::uint32_t>(row.Number("ParentId")));
    AppendNumber(out, row.Number("Type") == kFolderType ? 1 : 0);
    AppendNumber(out, name.size());
    AppendNumber(out, bytes.size());
    out += name;
    out += bytes;
}

std::string PackedNodes(MdbFile& file) {
    std::string packed;
    std::size_t count = 0;
    RawRows(file, "MSysAccessStorage").ForEach([&](const RawRows& row) {
        AppendNode(packed, row);
        return ++count < kMostNodes;
    });
    return packed;
}

/// The bytes of the year 2000: rows of an OLE compound file, in the order of their ids.
std::string CompoundRows(MdbFile& file) {
    std::map<std::int32_t, std::string> rows;
    RawRows(file, "MSysAccessObjects").ForEach([&](const RawRows& row) {
        if (row.Number("ID") >= 1)
            rows.emplace(row.Number("ID"), row.Bytes("Data"));
        return rows.size() < kMostNodes;
    });
    std::string bytes;
    for (const auto& [id, part] : rows)
        bytes += part;
    return bytes;
}

/// Texts of the library's newer formats may be compressed: two bytes FF FE and then single bytes.
std::string NameOf(std::string_view bytes) {
    if (!bytes.starts_with("\xFF\xFE"))
        return FromUtf16Bytes(bytes);
    std::string wide;
    bool narrow = true;
    bytes.remove_prefix(2);
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        if (bytes[i] == '\0') {
            narrow = !narrow;
        } else if (narrow) {
            wide += bytes[i];
            wide += '\0';
        } else {
            wide += bytes.substr(i, 2);
            ++i;
        }
    }
    return FromUtf16Bytes(wide);
}

std::vector<StorageNode> UnpackNodes(std::string_view packed) {
    ByteReader reader(packed, "The storage");
    std::vector<StorageNode> nodes;
    while (!reader.AtEnd()) {
        StorageNode node;
        node.id = static_cast<std::int32_t>(reader.U32());
        node.parent = static_cast<std::int32_t>(reader.U32());
        node.isFolder = reader.U32() == 1;
        const auto nameBytes = reader.U32();
        const auto bytes = reader.U32();
        node.name = NameOf(reader.Take(nameBytes));
        node.bytes = std::string(reader.Take(bytes));
        nodes.push_back(std::move(node));
    }
    return nodes;
}

} // namespace

Storage ReadStorage(const std::string& nativePath) {
    constexpr char kNodes = 'N';
    constexpr char kCompound = 'C';
    auto answer = RunGuarded(nativePath, [&] {
        MdbFile file(nativePath);
        auto nodes = PackedNodes(file);
        return nodes.empty() ? CompoundRows(file) + kCompound : nodes + kNodes;
    });
    const char kind = answer.back();
    answer.pop_back();
    if (kind == kNodes)
        return Storage(UnpackNodes(answer));
    return answer.empty() ? Storage() : Storage(ReadCompoundFile(answer));
}

} // namespace tovimar::platform::access
