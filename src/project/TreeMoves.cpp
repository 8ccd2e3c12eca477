#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"
#include "project/TreeEdit.h"

#include <array>
#include <utility>

/// Moves by one place, and by drag and drop.
namespace tovimar {
namespace {

constexpr const char* kControlAsTarget =
    "Forbidden operation for controls: control can't be a target of copy, move or paste operation.";

/// The sibling that many places away, among those that the view shows: an expanded list keeps placeholders
/// between them that nobody sees. Null at the ends.
CHelpPrjTreeNode* ShownNeighbour(const CHelpPrjTreeNode& node, int step) {
    const auto& siblings = node.Parent->Children();
    const auto own = siblings.PositionOf(node);
    const auto count = static_cast<std::ptrdiff_t>(siblings.Count());
    if (own == 0)
        return nullptr;
    for (auto at = static_cast<std::ptrdiff_t>(own) + step; at >= 1 && at <= count; at += step)
        if (auto* sibling = siblings.At(static_cast<std::size_t>(at)).get(); sibling->TreeViewNode != nullptr)
            return sibling;
    return nullptr;
}

/// A move by one place is taken back by the opposite one, of the node as its key finds it now.
class StepEdit : public TreeEdit {
public:
    bool ChangesStructure() const override { return true; }
    bool Run(TreeEditRun& run) const override {
        if (run.node != nullptr && run.node->Parent != nullptr)
            Step(run);
        return true;
    }
    void Undo(TreeEditRun& run, const CHelpPrjTreeOperation& done) const override {
        const auto piece = TreeEditRun::LoadPiece(done.OperationAffectedXML);
        if (piece == nullptr)
            return;
        run.node = run.tree.MapItem(piece->Root()->Key());
        piece->Terminate();
        MoveEditOf(Opposite())->Run(run);
    }

private:
    virtual void Step(TreeEditRun& run) const = 0;
    virtual const char* Opposite() const = 0;
};

class UpEdit : public StepEdit {
public:
    const char* Name() const override { return "Up"; }

private:
    const char* Opposite() const override { return "Down"; }
    void Step(TreeEditRun& run) const override {
        if (auto* previous = ShownNeighbour(*run.node, -1))
            run.Relocate({run.node->Parent, previous, nullptr, /*beforePrevious=*/true}, /*keepKeys=*/true);
    }
};

class DownEdit : public StepEdit {
public:
    const char* Name() const override { return "Down"; }

private:
    const char* Opposite() const override { return "Up"; }
    void Step(TreeEditRun& run) const override {
        if (auto* next = ShownNeighbour(*run.node, 1))
            run.Relocate({run.node->Parent, nullptr, next, false, /*afterNext=*/true}, /*keepKeys=*/true);
    }
};

/// In front of its parent.
class LeftEdit : public StepEdit {
public:
    const char* Name() const override { return "Left"; }

private:
    const char* Opposite() const override { return "Right"; }
    void Step(TreeEditRun& run) const override {
        auto* parent = run.node->Parent;
        if (run.node->Level > 2 && parent->Parent != nullptr)
            run.Relocate({parent->Parent, parent, nullptr, /*beforePrevious=*/true}, /*keepKeys=*/true);
    }
};

/// The next sibling becomes the parent, the node its first child.
class RightEdit : public StepEdit {
public:
    const char* Name() const override { return "Right"; }

private:
    const char* Opposite() const override { return "Left"; }
    void Step(TreeEditRun& run) const override {
        auto* sibling = run.node->Level < 2 ? nullptr : ShownNeighbour(*run.node, 1);
        if (sibling == nullptr)
            return;
        if (sibling->IsControl || sibling->IsMenu) {
            run.operation.ErrMessage = kControlAsTarget;
            return;
        }
        if (!sibling->Skipped())
            run.Relocate({sibling, FirstShownChild(*sibling), nullptr, /*beforePrevious=*/true},
                         /*keepKeys=*/true);
    }
};

class MoveNodeEdit : public TreeEdit {
public:
    const char* Name() const override { return "MoveNode"; }
    bool ChangesStructure() const override { return true; }
    bool Run(TreeEditRun& run) const override {
        Move(run, run.operation.SourceNodeKey, run.operation.TargetNodeKey);
        return true;
    }
    /// Back as the last child of its old parent.
    void Undo(TreeEditRun& run, const CHelpPrjTreeOperation& done) const override {
        Move(run, done.SourceNodeKey, done.SourceNodeParentKey);
    }

private:
    static void Move(TreeEditRun& run, const std::string& source, const std::string& target) {
        run.node = run.tree.MapItem(source);
        auto* parent = run.tree.MapItem(target);
        if (run.node == nullptr || parent == nullptr)
            return;
        run.Select(*run.node);
        run.Relocate({parent}, /*keepKeys=*/false);
    }
};

} // namespace

const TreeEdit* MoveEditOf(const std::string& opCode) {
    static const UpEdit up;
    static const DownEdit down;
    static const LeftEdit left;
    static const RightEdit right;
    static const MoveNodeEdit move;
    const std::array<const TreeEdit*, 5> moves = {&up, &down, &left, &right, &move};
    for (const auto* edit : moves)
        if (text::EqualsIgnoringCase(edit->Name(), opCode))
            return edit;
    return nullptr;
}

} // namespace tovimar
