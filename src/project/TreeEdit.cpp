#include "project/TreeEdit.h"

#include "foundation/Product.h"
#include "foundation/ShowMessage.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"

#include <array>
#include <utility>

/// The clipboard's edits, the texts, and undo.
namespace tovimar {
namespace {

constexpr std::int32_t kInsertKey = 45;

/// The sibling of that key, as long as it still stands below the parent.
CHelpPrjTreeNode* SiblingOf(const TreeEditRun& run, const CHelpPrjTreeNode& parent, const std::string& key) {
    auto* sibling = key.empty() ? nullptr : run.tree.MapItem(key);
    return sibling != nullptr && sibling->Parent == &parent && sibling->TreeViewNode != nullptr ? sibling
                                                                                                : nullptr;
}

/// Puts what was taken out back between its neighbours, under its own keys.
void UndoRemoval(TreeEditRun& run, const CHelpPrjTreeOperation& done) {
    const auto piece = TreeEditRun::LoadPiece(done.OperationAffectedXML);
    if (piece == nullptr)
        return;
    const auto& root = *piece->Root();
    PastePlace place;
    place.parent = run.tree.MapItem(root.ParentKey());
    if (place.parent == nullptr)
        place.parent = run.tree.Root();
    if (place.parent == nullptr)
        return;
    place.previous = SiblingOf(run, *place.parent, root.PreviousNodeKey());
    place.next = SiblingOf(run, *place.parent, root.NextNodeKey());
    run.Paste(*piece, place, /*pasteChildren=*/true, /*keepKeys=*/true);
}

class CopyEdit : public TreeEdit {
public:
    const char* Name() const override { return "Copy"; }
    bool Run(TreeEditRun& run) const override {
        run.Copy();
        return true;
    }
    bool CanBeUndone() const override { return false; }
};

class CutEdit : public TreeEdit {
public:
    const char* Name() const override { return "Cut"; }
    bool ChangesStructure() const override { return true; }
    bool Run(TreeEditRun& run) const override {
        run.Copy();
        if (std::exchange(run.operation.RetCode, kGeneralFailure) == kSuccess)
            run.Delete(/*silent=*/true);
        return true;
    }
    void Undo(TreeEditRun& run, const CHelpPrjTreeOperation& done) const override { UndoRemoval(run, done); }
};

class DeleteEdit : public TreeEdit {
public:
    const char* Name() const override { return "Delete"; }
    bool ChangesStructure() const override { return true; }
    bool Run(TreeEditRun& run) const override {
        run.Delete(/*silent=*/false);
        return true;
    }
    void Undo(TreeEditRun& run, const CHelpPrjTreeOperation& done) const override { UndoRemoval(run, done); }
};

class PasteEdit : public TreeEdit {
public:
    explicit PasteEdit(bool special) : special_(special) {}
    const char* Name() const override { return special_ ? "PasteSpecial" : "Paste"; }
    bool ChangesStructure() const override { return true; }
    bool Run(TreeEditRun& run) const override {
        const auto piece = run.node == nullptr ? nullptr : TreeEditRun::LoadPiece(run.operation.XMLSTr);
        if (piece != nullptr)
            run.Paste(*piece, {run.node}, !special_ || WantsChildren(*piece->Root()), /*keepKeys=*/false);
        return true;
    }
    void Undo(TreeEditRun& run, const CHelpPrjTreeOperation& done) const override {
        UndoInsertion(run, done);
    }

private:
    static bool WantsChildren(const CHelpPrjTreeNode& root) {
        return root.Children().Empty() ||
               ShowMessage("Would you like to paste child nodes?", kMsgYesNo | kMsgQuestion,
                           kApplicationTitle, {}, 0,
                           "CHelpPrjTreeOperation.PasteSpecial") == platform::kAnswerYes;
    }
    bool special_;
};

/// Has no place among what can be undone.
class SkipEdit : public TreeEdit {
public:
    const char* Name() const override { return "ToggleSkippedFlag"; }
    bool Run(TreeEditRun& run) const override {
        std::int32_t key = kInsertKey;
        std::int32_t shift = 0;
        run.tree.KeyDown(key, shift);
        return false;
    }
};

class ContentsTextEdit : public TreeEdit {
public:
    const char* Name() const override { return "HHC"; }
    bool CanBeUndone() const override { return false; }
    bool Run(TreeEditRun& run) const override {
        if (run.node == nullptr)
            return false;
        run.operation.HHCStr = run.node->HHCStr(1, /*vfSkipSerializers=*/true,
                                                /*vfForceContentsRebuild=*/false);
        run.Succeed();
        return false;
    }
};

class XmlTextEdit : public TreeEdit {
public:
    const char* Name() const override { return "XML"; }
    bool CanBeUndone() const override { return false; }
    bool Run(TreeEditRun& run) const override {
        if (run.node == nullptr)
            return false;
        run.operation.XMLSTr = text::Trim(run.node->XMLSTr(1, /*vfSkipSerializers=*/true, /*vfExtInfo=*/true,
                                                           /*vfIncludeXMLHeader=*/true, {}));
        run.Succeed();
        return false;
    }
};

class UndoEdit : public TreeEdit {
public:
    const char* Name() const override { return "Undo"; }
    bool ChangesStructure() const override { return true; }
    bool CanBeUndone() const override { return false; }
    bool Run(TreeEditRun& run) const override {
        while (!run.undoList.empty()) {
            const auto done = run.undoList.back();
            run.undoList.pop_back();
            const auto* edit = TreeEditOf(done->OpCode);
            if (edit == nullptr || !edit->CanBeUndone() || done->RetCode != kSuccess)
                continue;
            edit->Undo(run, *done);
            // The entry is used up, whatever was left to take back.
            run.Succeed();
            break;
        }
        return false;
    }
};

} // namespace

void UndoInsertion(TreeEditRun& run, const CHelpPrjTreeOperation& done) {
    const auto piece = TreeEditRun::LoadPiece(done.OperationAffectedXML);
    if (piece == nullptr)
        return;
    run.node = run.tree.MapItem(piece->Root()->Key());
    run.Delete(/*silent=*/true);
}

CHelpPrjTreeNode* FirstShownChild(const CHelpPrjTreeNode& parent) {
    for (const auto& child : parent.Children())
        if (child->TreeViewNode != nullptr)
            return child.get();
    return nullptr;
}

const TreeEdit* TreeEditOf(const std::string& opCode) {
    static const CopyEdit copy;
    static const CutEdit cut;
    static const DeleteEdit remove;
    static const PasteEdit paste(/*special=*/false);
    static const PasteEdit pasteSpecial(/*special=*/true);
    static const SkipEdit skip;
    static const ContentsTextEdit contents;
    static const XmlTextEdit xml;
    static const UndoEdit undo;
    static const std::array<std::pair<const char*, const TreeEdit*>, 9> edits = {
        {{"Copy", &copy},
         {"Cut", &cut},
         {"Delete", &remove},
         {"Paste", &paste},
         {"Paste Special", &pasteSpecial},
         {"Toggle Skipped Flag", &skip},
         {"HHC", &contents},
         {"XML", &xml},
         {"Undo", &undo}}};
    for (const auto& [code, edit] : edits)
        if (text::EqualsIgnoringCase(code, opCode))
            return edit;
    if (const auto* move = MoveEditOf(opCode))
        return move;
    const auto* topic = TopicEditOf(opCode);
    return topic != nullptr ? topic : IndexEditOf(opCode);
}

} // namespace tovimar
