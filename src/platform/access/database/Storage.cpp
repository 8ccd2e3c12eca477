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

Storage::Storage(std::vector<StorageNode> nodes) : nodes_(std::move(nodes)) {
    for (const auto& node : nodes_)
        if (node.id == node.parent)
            root_ = root_ == nullptr ? &node : root_;
        else
            children_[node.parent].push_back(&node);
}

const StorageNode* Storage::Child(const StorageNode& folder, std::string_view name) const {
    const auto found = children_.find(folder.id);
    if (found == children_.end())
        return nullptr;
    for (const auto* child : found->second)
        if (text::EqualsIgnoringCase(child->name, name))
            return child;
    return nullptr;
}

const StorageNode* Storage::Find(const std::vector<std::string_view>& path) const {
    const auto* node = root_;
    for (const auto name : path)
        node = node != nullptr ? Child(*node, name) : nullptr;
    return node;
}

std::vector<const StorageNode*> Storage::Children(const StorageNode& folder) const {
    const auto found = children_.find(folder.id);
    return found == children_.end() ? std::vector<const StorageNode*>() : found->second;
}

} // namespace tovimar::platform::access
