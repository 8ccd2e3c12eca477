#pragma once

#include <cstdint>
#include <string>
#include <unordered_map>

namespace tovimar {

class CHelpPrjTreeNode;

/// Look-up tables over all nodes below and with a root, so that the questions which are asked once per
/// object or per field (is this file name taken, which page is this table's) don't walk the tree. The
/// tables are made at the first question after a change; additions are taken over as they happen.
class TreeIndex {
public:
    /// Nodes with this generated file name, the root included.
    std::size_t FilesNamed(const CHelpPrjTreeNode& root, const std::string& fileName);
    /// Nodes with this generated file name without extension, the root included.
    std::size_t BaseNamesNamed(const CHelpPrjTreeNode& root, const std::string& baseName);
    /// The first node in pre-order with this name and tag; with `needsFile` the first that has a page.
    const CHelpPrjTreeNode* ByNameAndTag(const CHelpPrjTreeNode& root, const std::string& name,
                                         const std::string& tag, bool needsFile);

    /// A node with its subtree was appended to the tree.
    void Added(const CHelpPrjTreeNode& node);
    /// A node's generated file name changes; called around the change.
    void FileNameGoes(const CHelpPrjTreeNode& node) { CountFile(node, -1); }
    void FileNameComes(const CHelpPrjTreeNode& node) { CountFile(node, 1); }
    /// Something else changed: all tables are made anew at the next question.
    void Forget();
    /// Names, tags or the order changed.
    void ForgetNames() { namesKnown_ = false; }

private:
    struct Named {
        const CHelpPrjTreeNode* first = nullptr;
        const CHelpPrjTreeNode* firstWithFile = nullptr;
    };

    void MakeFiles(const CHelpPrjTreeNode& root);
    void MakeNames(const CHelpPrjTreeNode& root);
    void CountSubtree(const CHelpPrjTreeNode& node);
    void CountFile(const CHelpPrjTreeNode& node, int change);
    void NoteNames(const CHelpPrjTreeNode& node);

    bool filesKnown_ = false;
    bool namesKnown_ = false;
    std::unordered_map<std::string, std::int64_t> files_;
    std::unordered_map<std::string, std::int64_t> baseNames_;
    std::unordered_map<std::string, Named> names_;
};

} // namespace tovimar
