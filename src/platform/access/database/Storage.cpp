#include "platform/access/database/Storage.h"

#include "platform/access/database/Bytes.h"
#include "platform/text/Text.h"

namespace tovimar::platform::access {

std::vector<FolderName> ReadFolderNames(std::string_view dirData) {
    ByteReader reader(dirData, "The list of names");
    std::vector<FolderName> names;
    if (reader.AtEnd())
        return names;
    reader.Skip(4);
    while (!reader.AtEnd()) {
        reader.Skip(1);
        const std::size_t length = reader.U8();
        if (length < 4)
            reader.Fail("holds an entry without a folder");
        FolderName entry;
        entry.name = FromUtf16Bytes(reader.Take(length - 4));
        entry.folder = reader.U32();
        names.push_back(std::move(entry));
    }
    return names;
}

namespace {

std::string KeyOf(std::int32_t parent, std::string_view name) {
    return std::to_string(parent) + "/" + text::FoldCase(std::string(name));
}

} // namespace

Storage::Storage(std::vector<StorageNode> nodes) : nodes_(std::move(nodes)) {
    for (const auto& node : nodes_)
        if (node.id != node.parent)
            children_.emplace(KeyOf(node.parent, node.name), &node);
        else if (root_ == nullptr)
            root_ = &node;
}

const StorageNode* Storage::Child(const StorageNode& folder, std::string_view name) const {
    const auto found = children_.find(KeyOf(folder.id, name));
    return found == children_.end() ? nullptr : found->second;
}

const StorageNode* Storage::Find(const std::vector<std::string_view>& path) const {
    const auto* node = root_;
    for (const auto name : path)
        node = node != nullptr ? Child(*node, name) : nullptr;
    return node;
}

} // namespace tovimar::platform::access
