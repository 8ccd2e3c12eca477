#include "platform/access/database/CompoundFile.h"

#include "platform/access/database/Bytes.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

constexpr std::string_view kSignature = "\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1";
constexpr std::uint32_t kLastRegularSector = 0xFFFFFFFA;
constexpr std::uint32_t kNoEntry = 0xFFFFFFFF;
constexpr std::size_t kEntryBytes = 128;
constexpr std::uint32_t kSmallSector = 64;
constexpr std::size_t kMostEntries = 100000;

struct Entry {
    std::string name;
    std::uint8_t type = 0; ///< 1 folder, 2 stream, 5 root
    std::uint32_t left = kNoEntry;
    std::uint32_t right = kNoEntry;
    std::uint32_t child = kNoEntry;
    std::uint32_t start = 0;
    std::uint32_t size = 0;
};

class CompoundFile {
public:
    explicit CompoundFile(std::string_view bytes) : bytes_(bytes) {
        ReadHeader();
        ReadEntries();
    }

    std::vector<StorageNode> Nodes() {
        std::vector<StorageNode> nodes;
        if (entries_.empty())
            return nodes;
        nodes.push_back({0, 0, true, entries_[0].name, {}});
        std::vector<bool> seen(entries_.size(), false);
        std::vector<std::pair<std::uint32_t, std::int32_t>> open{{entries_[0].child, 0}};
        while (!open.empty()) {
            const auto [index, parent] = open.back();
            open.pop_back();
            if (index >= entries_.size() || seen[index])
                continue;
            seen[index] = true;
            const auto& entry = entries_[index];
            const auto id = static_cast<std::int32_t>(index);
            const bool isFolder = entry.type != 2;
            nodes.push_back({id, parent, isFolder, entry.name, isFolder ? std::string() : Stream(entry)});
            open.emplace_back(entry.left, parent);
            open.emplace_back(entry.right, parent);
            if (isFolder)
                open.emplace_back(entry.child, id);
        }
        return nodes;
    }

private:
    using Sectors = std::vector<std::uint32_t>;

    void ReadHeader() {
        ByteReader reader(bytes_, "The compound file");
        if (reader.Take(kSignature.size()) != kSignature)
            reader.Fail("begins with something else");
        reader.Skip(22);
        const auto sectorBits = reader.U16();
        if (sectorBits != 9 && sectorBits != 12)
            reader.Fail("has sectors of an unknown size");
        sectorSize_ = std::size_t{1} << sectorBits;
        reader.Skip(16);
        directoryStart_ = reader.U32();
        reader.Skip(4);
        smallest_ = reader.U32();
        const auto smallTableStart = reader.U32();
        reader.Skip(4);
        auto tableSector = reader.U32();
        reader.Skip(4);
        Sectors tables;
        for (int i = 0; i < 109; ++i)
            tables.push_back(reader.U32());
        const std::size_t sectors = bytes_.size() / sectorSize_;
        for (std::size_t i = 0; tableSector < kLastRegularSector && i < sectors; ++i) {
            const auto more = Numbers(Sector(tableSector));
            if (more.empty())
                break;
            tables.insert(tables.end(), more.begin(), more.end() - 1);
            tableSector = more.back();
        }
        for (const auto table : tables)
            if (table < kLastRegularSector && next_.size() <= sectors) {
                const auto part = Numbers(Sector(table));
                next_.insert(next_.end(), part.begin(), part.end());
            }
        nextSmall_ = Numbers(Chain(smallTableStart, bytes_.size()));
    }

    void ReadEntries() {
        const auto directory = Chain(directoryStart_, std::min(bytes_.size(), kMostEntries * kEntryBytes));
        for (std::size_t at = 0; at + kEntryBytes <= directory.size(); at += kEntryBytes) {
            ByteReader reader(std::string_view(directory).substr(at, kEntryBytes), "The compound file");
            Entry entry;
            const auto name = reader.Take(64);
            const std::size_t nameBytes = std::min<std::size_t>(reader.U16(), 64);
            entry.name = FromUtf16Bytes(name.substr(0, nameBytes < 2 ? 0 : nameBytes - 2));
            entry.type = reader.U8();
            reader.Skip(1);
            entry.left = reader.U32();
            entry.right = reader.U32();
            entry.child = reader.U32();
            reader.Skip(36);
            entry.start = reader.U32();
            entry.size = reader.U32();
            entries_.push_back(std::move(entry));
        }
        if (!entries_.empty())
            smallSectors_ = Chain(entries_[0].start, entries_[0].size);
    }

    std::string_view Sector(std::uint32_t number) const {
        const std::size_t at = (std::size_t{number} + 1) * sectorSize_;
        return at >= bytes_.size() ? std::string_view() : bytes_.substr(at, sectorSize_);
    }

    static Sectors Numbers(std::string_view bytes) {
        Sectors numbers;
        ByteReader reader(bytes, "The compound file");
        while (reader.Left() >= 4)
            numbers.push_back(reader.U32());
        return numbers;
    }

    /// No chain is longer than the file: one that is leads in circles.
    std::string Chain(std::uint32_t sector, std::size_t most) const {
        most = std::min(most, bytes_.size());
        std::string chain;
        while (sector < kLastRegularSector && chain.size() < most) {
            const auto bytes = Sector(sector);
            if (bytes.empty())
                break;
            chain += bytes;
            sector = sector < next_.size() ? next_[sector] : kNoEntry;
        }
        chain.resize(std::min(chain.size(), most));
        return chain;
    }

    std::string SmallChain(std::uint32_t sector, std::size_t size) const {
        std::string chain;
        while (sector < kLastRegularSector && chain.size() < size) {
            const std::size_t at = std::size_t{sector} * kSmallSector;
            if (at >= smallSectors_.size())
                break;
            chain += smallSectors_.substr(at, kSmallSector);
            sector = sector < nextSmall_.size() ? nextSmall_[sector] : kNoEntry;
        }
        chain.resize(std::min(chain.size(), size));
        return chain;
    }

    /// Streams share no sectors: all of them together are no longer than the file.
    std::string Stream(const Entry& entry) {
        const std::size_t size = std::min<std::size_t>(entry.size, left_);
        auto stream = entry.size < smallest_ ? SmallChain(entry.start, size) : Chain(entry.start, size);
        left_ -= stream.size();
        return stream;
    }

    std::string_view bytes_;
    std::size_t left_ = bytes_.size();
    std::size_t sectorSize_ = 512;
    std::uint32_t directoryStart_ = 0;
    std::uint32_t smallest_ = 4096; ///< smaller streams lie in the small sectors
    Sectors next_;
    Sectors nextSmall_;
    std::vector<Entry> entries_;
    std::string smallSectors_;
};

} // namespace

std::vector<StorageNode> ReadCompoundFile(std::string_view bytes) {
    return CompoundFile(bytes).Nodes();
}

} // namespace tovimar::platform::access
