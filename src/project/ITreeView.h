#pragma once

#include <cstddef>
#include <string>

namespace tovimar {

/// One entry of a tree view. Entries belong to their view; the pointers stay valid until the entry is
/// removed or the view is cleared. Images are keys of an image list: "helptopic", "hlpclose",
/// "openedBook", "no", "form", "report", "document".
class ITreeViewNode {
public:
    virtual ~ITreeViewNode() = default;

    virtual std::string Key() const = 0;
    virtual std::string Text() const = 0;
    virtual void SetText(const std::string& text) = 0;
    virtual std::string Image() const = 0;
    virtual void SetImage(const std::string& image) = 0;
    virtual void SetTag(const std::string& tag) = 0;
    virtual bool Expanded() const = 0;
    virtual void SetExpanded(bool expanded) = 0;
    virtual bool Selected() const = 0;
    /// Selecting an entry takes the selection from the one that had it.
    virtual void SetSelected(bool selected) = 0;

    /// Neighbours in the view; null where there is none.
    virtual ITreeViewNode* Parent() const = 0;
    virtual ITreeViewNode* Next() const = 0;
    virtual ITreeViewNode* Previous() const = 0;
    /// The first child; null for a leaf.
    virtual ITreeViewNode* Child() const = 0;
    /// Count of direct children.
    virtual std::size_t Children() const = 0;
};

/// Where a new entry goes, seen from its relative.
enum class TreeViewRelation { LastChild, Before, After };

/// The view that mirrors a project tree. The tree edits it and reads nothing from it but the selection
/// and, when it is written to a file, the neighbours of an entry.
class ITreeView {
public:
    virtual ~ITreeView() = default;

    virtual void ClearNodes() = 0;
    /// Without a relative the entry goes to the end of the top level. Raises 457 when the key is taken.
    virtual ITreeViewNode* AddNode(ITreeViewNode* relative, TreeViewRelation relation, const std::string& key,
                                   const std::string& text, const std::string& image) = 0;
    /// Takes the entry and all below it out; an absent key is no failure.
    virtual void RemoveNode(const std::string& key) = 0;
    virtual ITreeViewNode* SelectedItem() const = 0;
};

} // namespace tovimar
