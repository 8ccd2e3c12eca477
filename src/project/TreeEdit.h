#pragma once

#include "project/CHelpPrjTreeOperation.h"

#include <memory>
#include <optional>
#include <string>

namespace tovimar {

class CHelpPrjTreeNode;

/// Where a pasted node goes: behind all children of the parent, or beside one of them.
struct PastePlace {
    CHelpPrjTreeNode* parent = nullptr;
    CHelpPrjTreeNode* previous = nullptr;
    CHelpPrjTreeNode* next = nullptr;
    bool beforePrevious = false;
    bool afterNext = false;
};

/// One operation while it runs: its node, and the steps that the kinds of edit share.
class TreeEditRun {
public:
    TreeEditRun(CHelpPrjTreeOperation& ofOperation, ITreeView& onView, CHelpPrjTree& onTree,
                TreeOperationList& ofUndo);

    CHelpPrjTreeOperation& operation;
    ITreeView& view;
    CHelpPrjTree& tree;
    TreeOperationList& undoList;
    /// The node that is worked on; null without one.
    CHelpPrjTreeNode* node = nullptr;
    std::optional<std::string> parameter;
    std::string* answer = nullptr;

    void Copy();
    /// Takes the node out. Asks about its page unless it is to be silent.
    void Delete(bool silent);
    /// A node's text as a tree of its own; null when it can't be read.
    static std::unique_ptr<CHelpPrjTree> LoadPiece(const std::string& xml);
    /// Moves the piece's root into the tree and selects it. Without `keepKeys` it gets new keys where the
    /// tree has them.
    void Paste(CHelpPrjTree& piece, const PastePlace& place, bool pasteChildren, bool keepKeys);
    /// Cuts the node and pastes it elsewhere. A node whose text can't be read back stays where it is.
    void Relocate(const PastePlace& place, bool keepKeys);
    /// Makes a node of one element's text and hangs it below the current node.
    void AddNode(const std::string& xml);
    void Select(CHelpPrjTreeNode& selected) const;
    void Succeed() const { operation.RetCode = kSuccess; }
    /// Shows a warning.
    static void Tell(const std::string& text, const char* source);

private:
    void TakeOut();
};

/// One kind of edit.
class TreeEdit {
public:
    virtual ~TreeEdit() = default;
    /// As reports of failures name it.
    virtual const char* Name() const = 0;
    /// Whether the tree counts as changed by it.
    virtual bool Run(TreeEditRun& run) const = 0;
    virtual bool ChangesStructure() const { return false; }
    /// An undo passes over the others.
    virtual bool CanBeUndone() const { return true; }
    /// Takes an earlier run back, the operation's own text being what that run touched.
    virtual void Undo(TreeEditRun& /*run*/, const CHelpPrjTreeOperation& /*done*/) const {}
};

/// By its code, without regard to case; null for an unknown one.
const TreeEdit* TreeEditOf(const std::string& opCode);

// The families of edits; each null for a code of another one.
const TreeEdit* MoveEditOf(const std::string& opCode);  ///< "Up", "Down", "Left", "Right", "MoveNode"
const TreeEdit* TopicEditOf(const std::string& opCode); ///< "New", "Add"
const TreeEdit* IndexEditOf(const std::string& opCode); ///< "Edit Node Index"

/// Takes out what an edit has put in; the page stays on the disk.
void UndoInsertion(TreeEditRun& run, const CHelpPrjTreeOperation& done);
/// The first child that the view shows; null for none. Placeholders of an expanded list have no entry.
CHelpPrjTreeNode* FirstShownChild(const CHelpPrjTreeNode& parent);

} // namespace tovimar
