#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"

#include <cstdio>
#include <utility>

/// Children, removal and the keys of copied subtrees.
namespace tovimar {

std::int32_t CHelpPrjTreeNode::NodesQty() const {
    std::int32_t count = 0;
    for (const auto& child : children_)
        count += 1 + child->NodesQty();
    return count;
}

void CHelpPrjTreeNode::Traverse(bool vfSkipSerializers) const {
    if (vfSkipSerializers && HasSerializer())
        return;
    for (const auto& child : children_)
        child->Traverse(vfSkipSerializers);
}

void CHelpPrjTreeNode::AdjustChildrenNodesLevel(std::int32_t vlngParentLevel, bool vfSkipSerializers) {
    for (const auto& child : children_) {
        if (vfSkipSerializers && child->HasSerializer())
            continue;
        child->Level = vlngParentLevel + 1;
        child->AdjustChildrenNodesLevel(child->Level, vfSkipSerializers);
    }
}

void CHelpPrjTreeNode::RemoveKeysFromKeyMap() {
    if (HelpPrjTree != nullptr)
        HelpPrjTree->RemoveFromMap(*this);
    for (const auto& child : children_)
        child->RemoveKeysFromKeyMap();
}

void CHelpPrjTreeNode::Release() {
    properties_.Release();
    indexes_.reset();
    templateFile_.clear();
    generatedFile_.clear();
    templateFileKnown_ = generatedFileKnown_ = true;
    TreeView = nullptr;
    TreeViewNode = nullptr;
    Parent = nullptr;
    HelpPrjTree = nullptr;
    terminated_ = true;
}

/// The list goes as a whole: taking children out one by one would cost the square of their number.
void CHelpPrjTreeNode::ReleaseSubtree() {
    for (const auto& child : children_) {
        child->ReleaseSubtree();
        if (child->HelpPrjTree != nullptr)
            child->HelpPrjTree->RemoveFromMap(*child);
        child->Release();
    }
    for (auto& child : std::exchange(children_, ChildList()))
        formerChildren_.push_back(std::move(child));
}

void CHelpPrjTreeNode::RemoveFromTreview() {
    const auto key = Key();
    if (HelpPrjTree != nullptr)
        HelpPrjTree->RemoveFromMap(*this);
    if (TreeView != nullptr && TreeViewNode != nullptr)
        TreeView->RemoveNode(key);
}

void CHelpPrjTreeNode::Terminate() {
    if (terminated_)
        return;
    ReleaseSubtree();
    RemoveFromTreview();
    if (HelpPrjTree != nullptr)
        HelpPrjTree->Index().Forget();
    if (auto* parent = std::exchange(Parent, nullptr))
        if (auto self = parent->TakeChild(*this))
            parent->formerChildren_.push_back(std::move(self));
    Release();
}

std::unique_ptr<CHelpPrjTreeNode> CHelpPrjTreeNode::TakeChild(const CHelpPrjTreeNode& child) {
    const auto position = children_.PositionOf(child);
    return position == 0 ? nullptr : children_.TakeAt(position);
}

void CHelpPrjTreeNode::DropChildrenControls() {
    ChildList kept;
    for (auto& entry : std::exchange(children_, ChildList())) {
        if (!entry->IsControl && !entry->IsMenu) {
            kept.Add(std::move(entry));
            continue;
        }
        entry->ReleaseSubtree();
        entry->RemoveFromTreview();
        entry->Release();
        formerChildren_.push_back(std::move(entry));
    }
    children_ = std::move(kept);
    if (HelpPrjTree != nullptr)
        HelpPrjTree->Index().Forget();
}

void CHelpPrjTreeNode::ClearChildrenCollection(bool vfKeepChildrenNodes) {
    if (HelpPrjTree != nullptr)
        HelpPrjTree->Index().Forget();
    if (!vfKeepChildrenNodes) {
        ReleaseSubtree();
        return;
    }
    for (auto& child : std::exchange(children_, ChildList())) {
        if (child->HelpPrjTree != nullptr)
            child->HelpPrjTree->RemoveFromMap(*child);
        formerChildren_.push_back(std::move(child));
    }
}

std::string CHelpPrjTreeNode::GeneratedKeySuffix() {
    char seconds[32];
    std::snprintf(seconds, sizeof seconds, "%.2f", platform::Env().clock->Timer());
    std::string suffix;
    for (const char* c = seconds; *c != '\0'; ++c)
        if (*c >= '0' && *c <= '9')
            suffix += *c;
    return suffix;
}

namespace {

/// The key without the suffix of an earlier copy.
std::string KeyBase(std::string key) {
    if (key.empty() || key.back() != '_')
        return key;
    key.pop_back();
    const auto suffix = key.rfind('_');
    return suffix == std::string::npos ? key : key.substr(0, suffix);
}

/// Two copies within a hundredth of a second wait for the clock to move. So do two nodes of one copy that
/// were copies of one node before: the key must be free among the others of the piece, too.
std::string FreeKey(const CHelpPrjTree& tree, const CHelpPrjTree* piece, const std::string& base) {
    constexpr double kLongestWait = 3;
    const auto start = platform::Env().clock->Timer();
    for (;;) {
        auto candidate = base + '_' + CHelpPrjTreeNode::GeneratedKeySuffix() + '_';
        if (tree.MapItem(candidate) == nullptr && (piece == nullptr || piece->MapItem(candidate) == nullptr))
            return candidate;
        platform::Env().doEvents();
        const auto now = platform::Env().clock->Timer();
        if (now - start > kLongestWait || now < start)
            throw RaisedError(10, "Can't generate treeview node key suffix.",
                              "CHelpPrjTreeNode.TestKeyIsDuplicate");
    }
}

} // namespace

void CHelpPrjTreeNode::AssignNewKeyIfDuplicate(CHelpPrjTree* robjHelpPrjTree) {
    auto* tree = robjHelpPrjTree != nullptr ? robjHelpPrjTree : HelpPrjTree;
    if (tree == nullptr)
        return;
    if (TreeView == nullptr)
        TreeView = tree->TreeView;
    if (TreeView == nullptr || tree->MapItem(Key()) == nullptr)
        return;
    SetKey(FreeKey(*tree, HelpPrjTree, KeyBase(Key())));
    for (const auto& child : children_)
        child->AssignNewKeyIfDuplicate(robjHelpPrjTree);
}

void CHelpPrjTreeNode::AssignNewKeysToAllNodesIfDuplicateInANewTree(CHelpPrjTree* robjTreeView2Merge,
                                                                    bool vfSkipSerializers) {
    AssignNewKeyIfDuplicate(robjTreeView2Merge);
    for (const auto& child : children_) {
        child->AssignNewKeyIfDuplicate(robjTreeView2Merge);
        if (!(vfSkipSerializers && child->HasSerializer()))
            child->AssignNewKeysToAllNodesIfDuplicateInANewTree(robjTreeView2Merge, vfSkipSerializers);
    }
}

CHelpPrjTreeNode* CHelpPrjTreeNode::Paste(std::unique_ptr<CHelpPrjTreeNode> node,
                                          CHelpPrjTreeNode* robjParent, ITreeView* rtvw,
                                          CHelpPrjTree* robjHelpPrjTree, CHelpPrjTreeNode* robjXmlPrevious,
                                          CHelpPrjTreeNode* robjXmlNext, bool vfBeforePrevious,
                                          bool vfAfterNext) {
    CHelpPrjTreeNode* placed = nullptr;
    Trapped("CHelpPrjTreeNode", "Paste", [&] {
        if (node == nullptr || robjParent == nullptr || rtvw == nullptr || robjHelpPrjTree == nullptr)
            return;
        node->TreeView = rtvw;
        node->HelpPrjTree = robjHelpPrjTree;
        node->AssignNewKeyIfDuplicate(robjHelpPrjTree);
        node->Level = robjParent->Level + 1;
        node->AdjustChildrenNodesLevel(node->Level, /*vfSkipSerializers=*/true);
        const auto viewNode = [](CHelpPrjTreeNode* of) { return of == nullptr ? nullptr : of->TreeViewNode; };
        node->DisplayInTreeview(rtvw, robjHelpPrjTree, /*vfSkipSerializers=*/false, viewNode(robjParent),
                                viewNode(robjXmlPrevious), viewNode(robjXmlNext), vfBeforePrevious,
                                vfAfterNext);
        placed = robjHelpPrjTree->addItem(robjParent, std::move(node), /*vfAutoUniqueKey=*/true,
                                          robjXmlPrevious, robjXmlNext, /*vfAddChildNodesToMap=*/true,
                                          vfBeforePrevious, vfAfterNext);
        if (placed != nullptr)
            placed->IsRootNode = false;
    });
    return placed;
}

CHelpPrjTreeNode* CHelpPrjTreeNode::GetUIObjectXMLNode(std::int32_t vlngObjectType,
                                                       const std::string& vstrObjectName) {
    for (const auto& child : children_) {
        const auto type = child->ObjectType();
        if (child->ProcessCode() == 999 && (type == 2 || type == 3) && type == vlngObjectType &&
            text::EqualsIgnoringCase(child->Name(), vstrObjectName))
            return child.get();
        if (auto* found = child->GetUIObjectXMLNode(vlngObjectType, vstrObjectName))
            return found;
    }
    return nullptr;
}

} // namespace tovimar
