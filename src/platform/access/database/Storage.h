#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

/// The tree of folders and streams in which a database keeps designs, macros and code.
namespace tovimar::platform::access {

struct StorageNode {
    std::int32_t id = 0;
    std::int32_t parent = 0; ///< the root is its own parent
    bool isFolder = false;
    std::string name; ///< UTF-8
    std::string bytes;
};

/// Folder number by object name, as a container's stream "\x03DirData" tells.
struct FolderName {
    std::string name;
    std::uint32_t folder = 0;
};
/// Raises 0x80040001 "The list of names ..." for bytes that end too early.
std::vector<FolderName> ReadFolderNames(std::string_view dirData);

class Storage {
public:
    Storage() = default;
    /// Nodes whose parents lead nowhere or in circles are never found.
    explicit Storage(std::vector<StorageNode> nodes);

    bool IsEmpty() const { return nodes_.empty(); }
    /// Child of that name, without regard to case; null when there is none.
    const StorageNode* Child(const StorageNode& folder, std::string_view name) const;
    const StorageNode* Root() const { return root_; }
    /// Down from the root; null when a step is missing.
    const StorageNode* Find(const std::vector<std::string_view>& path) const;

private:
    std::vector<StorageNode> nodes_;
    std::unordered_map<std::string, const StorageNode*> children_; ///< by the parent's id and the folded name
    const StorageNode* root_ = nullptr;
};

} // namespace tovimar::platform::access
