#include "platform/access/database/DesignBlob.h"

#include "platform/access/database/Bytes.h"
#include "platform/access/database/PropertyCodes.h"

#include <algorithm>
#include <functional>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kMaxDepth = 200;
constexpr std::uint16_t kCompactVersion = 0x13;
constexpr std::uint32_t kManyChildren = 0xFF;
constexpr std::uint32_t kOneChild = 0xFE;
constexpr std::uint32_t kNextObject = 0xFD;

/// Opens objects as the markers say: each list is left when it is full.
class TreeBuilder {
public:
    explicit TreeBuilder(BlobObject& root) : current_(&root) {}

    BlobObject& Current() { return *current_; }
    bool Closed() const {
        return std::all_of(open_.begin(), open_.end(), [](const List& list) { return list.left == 0; });
    }
    void OpenList(std::uint16_t count, const ByteReader& reader) {
        if (open_.size() >= kMaxDepth)
            reader.Fail("is nested deeper than " + std::to_string(kMaxDepth));
        open_.push_back({current_, count});
    }
    void Append(std::uint16_t type, const ByteReader& reader) {
        while (!open_.empty() && open_.back().left == 0)
            open_.pop_back();
        if (open_.empty())
            reader.Fail("holds an object that belongs nowhere");
        auto& list = open_.back();
        --list.left;
        list.owner->children.push_back(std::make_unique<BlobObject>());
        current_ = list.owner->children.back().get();
        current_->type = type;
    }

private:
    struct List {
        BlobObject* owner;
        std::uint16_t left;
    };
    std::vector<List> open_;
    BlobObject* current_;
};

DesignRecord ReadRecord(ByteReader& reader, std::uint32_t slot) {
    DesignRecord record;
    record.slot = slot;
    record.code = reader.U16();
    record.type = static_cast<ValueKind>(reader.U32() & 0xFFFFU);
    reader.Skip(4); // a width that says no more than the length
    const auto length = reader.U32();
    record.bytes = reader.Take(length);
    return record;
}

/// The slot tells how much a value takes, the property what it is.
DesignRecord ReadCompactRecord(ByteReader& reader, std::uint32_t slot, std::uint16_t objectType) {
    DesignRecord record;
    record.slot = slot;
    record.code = CodeOfSlot(objectType, slot);
    if (slot < 48) {
        record.type = ValueKind::Flag;
    } else if (slot < 96) {
        record.type = ValueKind::Byte;
        record.bytes = reader.Take(1);
    } else if (slot < 156) {
        record.type = ValueKind::Integer;
        record.bytes = reader.Take(2);
    } else if (slot < 188) {
        record.type = ValueKind::Long;
        record.bytes = reader.Take(4);
    } else {
        record.type = TypeOfCode(record.code);
        record.bytes = reader.Take(reader.U8());
    }
    return record;
}

void ReadItems(DesignBlob& design, ByteReader& reader) {
    const bool compact = design.version == kCompactVersion;
    TreeBuilder tree(*design.root);
    while (!reader.AtEnd()) {
        const std::uint32_t id = compact ? reader.U8() : reader.U32();
        if (id == kManyChildren) {
            const auto count = reader.U16();
            tree.OpenList(count, reader);
            if (count > 0)
                tree.Append(reader.U16(), reader);
        } else if (id == kOneChild) {
            tree.OpenList(1, reader);
            tree.Append(reader.U16(), reader);
        } else if (id == kNextObject) {
            if (reader.AtEnd() || tree.Closed())
                break;
            tree.Append(reader.U16(), reader);
        } else {
            auto& object = tree.Current();
            object.records.push_back(compact ? ReadCompactRecord(reader, id, object.type)
                                             : ReadRecord(reader, id));
        }
    }
    design.closed = tree.Closed();
    design.unread = reader.Left();
}

void ForEachRecord(BlobObject& object, const std::function<void(DesignRecord&)>& visit) {
    for (auto& record : object.records)
        visit(record);
    for (auto& child : object.children)
        ForEachRecord(*child, visit);
}

/// Newer builds of the host number every property above 450 one higher. Two of them differ by their type.
bool HasNewerCodes(BlobObject& root) {
    constexpr std::uint16_t kGridlineColor = 462;
    constexpr std::uint16_t kLayoutCachedLeft = 586;
    constexpr std::uint16_t kBehindLayoutCachedHeight = 590;
    int older = 0;
    int newer = 0;
    ForEachRecord(root, [&](const DesignRecord& record) {
        if (record.type == ValueKind::Long && record.code == kGridlineColor)
            ++older;
        if (record.type == ValueKind::Long && record.code == kGridlineColor + 1)
            ++newer;
        older += record.code == kLayoutCachedLeft ? 1 : 0;
        newer += record.code == kBehindLayoutCachedHeight ? 1 : 0;
    });
    return newer > older;
}

void UseOlderCodes(BlobObject& root) {
    constexpr std::uint16_t kLastCommonCode = 450;
    if (!HasNewerCodes(root))
        return;
    ForEachRecord(root, [](DesignRecord& record) {
        if (record.code > kLastCommonCode && record.code != kUnknownCode)
            --record.code;
    });
}

void MergeObject(BlobObject& object, BlobObject& delta) {
    if (object.type != delta.type)
        return;
    for (const auto& record : delta.records)
        if (record.slot >= 256)
            object.records.push_back(record);
    for (std::size_t i = 0; i < std::min(object.children.size(), delta.children.size()); ++i)
        MergeObject(*object.children[i], *delta.children[i]);
}

} // namespace

DesignBlob ReadDesignBlob(std::string_view blob) {
    ByteReader reader(blob, "The design");
    DesignBlob design;
    design.version = reader.U16();
    if (design.version < kCompactVersion || design.version > 0x20)
        reader.Fail("is of an encoding that isn't known, number " + std::to_string(design.version));
    reader.Skip(6);
    design.root = std::make_unique<BlobObject>();
    design.root->type = reader.U16();
    ReadItems(design, reader);
    if (design.version != kCompactVersion)
        UseOlderCodes(*design.root);
    return design;
}

void MergeDelta(DesignBlob& design, std::string_view delta) {
    auto later = ReadDesignBlob(delta);
    MergeObject(*design.root, *later.root);
}

} // namespace tovimar::platform::access
