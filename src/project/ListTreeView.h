#pragma once

#include "project/ITreeView.h"

#include <memory>
#include <string>
#include <unordered_map>

namespace tovimar {

/// A tree view without a window: the entries and the selection, no more. A program without windows edits a
/// tree through it. An entry is found by its key in constant time.
class ListTreeView : public ITreeView {
public:
    ListTreeView();
    ~ListTreeView() override;
    ListTreeView(const ListTreeView&) = delete;
    ListTreeView& operator=(const ListTreeView&) = delete;

    void ClearNodes() override;
    ITreeViewNode* AddNode(ITreeViewNode* relative, TreeViewRelation relation, const std::string& key,
                           const std::string& text, const std::string& image) override;
    /// A selection that goes with the entry passes to the entry behind it, else the one before, else the
    /// parent.
    void RemoveNode(const std::string& key) override;
    ITreeViewNode* SelectedItem() const override;

    std::size_t Count() const { return entries_.size(); }
    /// Null for an absent key.
    ITreeViewNode* Find(const std::string& key) const;
    /// Null selects nothing.
    void Select(ITreeViewNode* entry);

private:
    class Entry;

    void Forget(const Entry& entry);

    std::unique_ptr<Entry> top_;
    /// By folded key.
    std::unordered_map<std::string, Entry*> entries_;
    Entry* selected_ = nullptr;
};

} // namespace tovimar
