#include "project/TreeIndex.h"

#include "platform/text/Text.h"
#include "project/CHelpPrjTreeNode.h"

namespace tovimar {

namespace {

std::string NameAndTagKey(const std::string& name, const std::string& tag) {
    return text::FoldCase(name) + '\n' + text::FoldCase(tag);
}

std::int64_t CountOf(const std::unordered_map<std::string, std::int64_t>& counts, const std::string& name) {
    const auto found = counts.find(text::FoldCase(name));
    return found == counts.end() ? 0 : found->second;
}

} // namespace

std::size_t TreeIndex::FilesNamed(const CHelpPrjTreeNode& root, const std::string& fileName) {
    MakeFiles(root);
    return static_cast<std::size_t>(CountOf(files_, fileName));
}

std::size_t TreeIndex::BaseNamesNamed(const CHelpPrjTreeNode& root, const std::string& baseName) {
    MakeFiles(root);
    return static_cast<std::size_t>(CountOf(baseNames_, baseName));
}

const CHelpPrjTreeNode* TreeIndex::ByNameAndTag(const CHelpPrjTreeNode& root, const std::string& name,
                                                const std::string& tag, bool needsFile) {
    MakeNames(root);
    const auto found = names_.find(NameAndTagKey(name, tag));
    if (found == names_.end())
        return nullptr;
    return needsFile ? found->second.firstWithFile : found->second.first;
}

void TreeIndex::Added(const CHelpPrjTreeNode& node) {
    namesKnown_ = false;
    if (filesKnown_)
        CountSubtree(node);
}

void TreeIndex::Forget() {
    filesKnown_ = false;
    namesKnown_ = false;
}

void TreeIndex::MakeFiles(const CHelpPrjTreeNode& root) {
    if (filesKnown_)
        return;
    files_.clear();
    baseNames_.clear();
    filesKnown_ = true;
    CountSubtree(root);
}

void TreeIndex::CountSubtree(const CHelpPrjTreeNode& node) {
    CountFile(node, 1);
    for (const auto& child : node.Children())
        CountSubtree(*child);
}

void TreeIndex::CountFile(const CHelpPrjTreeNode& node, int change) {
    namesKnown_ = false;
    if (!filesKnown_)
        return;
    files_[text::FoldCase(node.GeneratedHTMLFile())] += change;
    baseNames_[text::FoldCase(node.HTMLFileNameNoExt())] += change;
}

void TreeIndex::MakeNames(const CHelpPrjTreeNode& root) {
    if (namesKnown_)
        return;
    names_.clear();
    namesKnown_ = true;
    NoteNames(root);
}

void TreeIndex::NoteNames(const CHelpPrjTreeNode& node) {
    auto& named = names_[NameAndTagKey(node.Name(), node.Tag)];
    if (named.first == nullptr)
        named.first = &node;
    if (named.firstWithFile == nullptr && !node.GeneratedHTMLFile().empty())
        named.firstWithFile = &node;
    for (const auto& child : node.Children())
        NoteNames(*child);
}

} // namespace tovimar
