#include "platform/access/database/StorageReader.h"

#include "platform/access/GuardedWork.h"
#include "platform/access/MdbFile.h"
#include "platform/access/database/Attachment.h"
#include "platform/access/database/Bytes.h"
#include "platform/access/database/CompoundFile.h"
#include "platform/text/Text.h"

#include <map>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kLongestStream = std::size_t{64} << 20U;
constexpr std::size_t kMostNodes = 100000;
constexpr std::size_t kMostResources = 1000;
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
    bool Has(const char* column) const { return columns_.contains(column); }
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

/// Records of four numbers and two texts, as the child hands them over.
struct Packed {
    enum class What : std::uint32_t { Node, CompoundFile, Resource, Theme };
    What what = What::Node;
    std::int32_t id = 0;
    std::int32_t parent = 0;
    bool isFolder = false;
    std::string_view name;
    std::string_view bytes;
};

void AppendNumber(std::string& out, std::size_t number) {
    for (unsigned bits = 0; bits < 32; bits += 8)
        out += static_cast<char>(number >> bits & 0xFFU);
}

void Append(std::string& out, const Packed& record) {
    AppendNumber(out, static_cast<std::uint32_t>(record.what));
    AppendNumber(out, static_cast<std::uint32_t>(record.id));
    AppendNumber(out, static_cast<std::uint32_t>(record.parent));
    AppendNumber(out, record.isFolder ? 1 : 0);
    AppendNumber(out, record.name.size());
    AppendNumber(out, record.bytes.size());
    out += record.name;
    out += record.bytes;
}

Packed TakeRecord(ByteReader& reader) {
    Packed record;
    record.what = static_cast<Packed::What>(reader.U32());
    record.id = static_cast<std::int32_t>(reader.U32());
    record.parent = static_cast<std::int32_t>(reader.U32());
    record.isFolder = reader.U32() == 1;
    const auto nameBytes = reader.U32();
    const auto bytes = reader.U32();
    record.name = reader.Take(nameBytes);
    record.bytes = reader.Take(bytes);
    return record;
}

/// False when there is no such table.
bool AppendNodes(MdbFile& file, std::string& out) {
    std::size_t count = 0;
    RawRows(file, "MSysAccessStorage").ForEach([&](const RawRows& row) {
        Append(out, {Packed::What::Node, row.Number("Id"), row.Number("ParentId"),
                     row.Number("Type") == kFolderType, row.Bytes("Name"), row.Bytes("Lv")});
        return ++count < kMostNodes;
    });
    return count > 0;
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

/// Themes and pictures: their rows name attachments, which lie in a hidden table of their own.
void AppendResources(MdbFile& file, std::string& out) {
    constexpr const char* kOwner = "MSysResources_Data";
    std::map<std::int32_t, std::string> attachments;
    for (const auto& name : file.TableNames()) {
        if (!name.starts_with("f_") || !name.ends_with("_Data"))
            continue;
        RawRows rows(file, name.c_str());
        if (rows.Has(kOwner))
            rows.ForEach([&](const RawRows& row) {
                attachments.emplace(row.Number(kOwner), row.Bytes("FileData"));
                return attachments.size() < kMostResources;
            });
    }
    RawRows(file, "MSysResources").ForEach([&](const RawRows& row) {
        const auto found = attachments.find(row.Number("Data"));
        if (found != attachments.end()) {
            const auto title = NameOf(row.Bytes("Type")) + '\n' + NameOf(row.Bytes("Extension")) + '\n' +
                               NameOf(row.Bytes("Name"));
            Append(out, {Packed::What::Resource, 0, 0, false, title, found->second});
        }
        return true;
    });
    for (const auto& [name, value] : file.Properties("MSysDb").own)
        if (name == "Theme Resource Name")
            Append(out, {Packed::What::Theme, 0, 0, false, value, {}});
}

StoredResource ResourceOf(const Packed& record) {
    const auto words = text::Split(std::string(record.name), "\n");
    StoredResource resource;
    if (words.size() == 3) {
        resource.type = words[0];
        resource.extension = words[1];
        resource.name = words[2];
    }
    resource.bytes = AttachmentContent(record.bytes);
    return resource;
}

StoredDesigns Unpack(std::string_view packed) {
    ByteReader reader(packed, "The storage");
    StoredDesigns designs;
    std::vector<StorageNode> nodes;
    while (!reader.AtEnd()) {
        const auto record = TakeRecord(reader);
        switch (record.what) {
        case Packed::What::Node:
            nodes.push_back(
                {record.id, record.parent, record.isFolder, NameOf(record.name), std::string(record.bytes)});
            break;
        case Packed::What::CompoundFile:
            nodes = ReadCompoundFile(record.bytes);
            break;
        case Packed::What::Resource:
            designs.resources.push_back(ResourceOf(record));
            break;
        case Packed::What::Theme:
            designs.themeName = std::string(record.name);
            break;
        }
    }
    designs.tree = Storage(std::move(nodes));
    return designs;
}

} // namespace

StoredDesigns ReadStorage(const std::string& nativePath) {
    return Unpack(RunGuarded(nativePath, [&] {
        MdbFile file(nativePath);
        std::string packed;
        if (!AppendNodes(file, packed))
            if (const auto bytes = CompoundRows(file); !bytes.empty())
                Append(packed, {Packed::What::CompoundFile, 0, 0, false, {}, bytes});
        AppendResources(file, packed);
        return packed;
    }));
}

} // namespace tovimar::platform::access
