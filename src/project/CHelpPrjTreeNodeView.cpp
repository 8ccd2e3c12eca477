#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "foundation/TextEncodings.h"
#include "generation/CTovimarParameters.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"

/// The node's mirror in a tree view.
namespace tovimar {

namespace {

constexpr std::int32_t kInsertKey = 45;

} // namespace

std::string CHelpPrjTreeNode::DisplayCaption() const {
    auto caption = Caption();
    if (auto* parameters = Session::Parameters();
        parameters != nullptr && caption.find('{') != std::string::npos)
        parameters->ReplaceTags(caption);
    return DecodeHtmlEntities(caption);
}

void CHelpPrjTreeNode::rtvwNodesAdd(ITreeViewNode* relative, TreeViewRelation relation,
                                    const std::string& image) {
    TreeViewNode = TreeView->AddNode(relative, relation, Key(), DisplayCaption(), image);
}

void CHelpPrjTreeNode::DisplayInTreeview(ITreeView* rtvw, CHelpPrjTree* robjHelpPrjTree,
                                         bool vfSkipSerializers, ITreeViewNode* robjParentNode,
                                         ITreeViewNode* robjPreviousNode, ITreeViewNode* robjNextNode,
                                         bool vfBeforePrevious, bool vfAfterNext,
                                         bool vfDisplayChildrenOnly) {
    Trapped("CHelpPrjTreeNode", "DisplayInTreeview", [&] {
        // An expanded placeholder has done its work; a new project still shows what it will hold.
        const bool newTree = robjHelpPrjTree != nullptr && robjHelpPrjTree->NewHtmlHelpProject;
        if (rtvw == nullptr || (HasSerializer() && (!newTree || vfSkipSerializers)))
            return;
        TreeView = rtvw;
        HelpPrjTree = robjHelpPrjTree;
        SetIcon(children_.Empty() ? "helptopic" : "hlpclose");
        auto* parent = robjParentNode;
        if (parent == nullptr && Parent != nullptr)
            parent = Parent->TreeViewNode;
        ShowInView(vfDisplayChildrenOnly, parent, robjPreviousNode, robjNextNode, vfBeforePrevious,
                   vfAfterNext);
        for (const auto& child : children_)
            if (!(vfDisplayChildrenOnly && child->TreeView == rtvw && child->TreeViewNode != nullptr))
                child->DisplayInTreeview(rtvw, robjHelpPrjTree, /*vfSkipSerializers=*/true);
    });
}

void CHelpPrjTreeNode::ShowInView(bool displayChildrenOnly, ITreeViewNode* parent, ITreeViewNode* previous,
                                  ITreeViewNode* next, bool beforePrevious, bool afterNext) {
    const auto image = Skipped() ? std::string("no") : Icon();
    if (previous != nullptr) {
        rtvwNodesAdd(previous, beforePrevious ? TreeViewRelation::Before : TreeViewRelation::After, image);
    } else if (next != nullptr) {
        rtvwNodesAdd(next, afterNext ? TreeViewRelation::After : TreeViewRelation::Before, image);
    } else if (parent == nullptr) {
        rtvwNodesAdd(nullptr, TreeViewRelation::LastChild, image);
    } else if (!displayChildrenOnly) {
        rtvwNodesAdd(parent, TreeViewRelation::LastChild, image);
        TreeViewNode->SetTag(Key());
    }
}

void CHelpPrjTreeNode::Expand() {
    if (TreeViewNode != nullptr && TreeViewNode->Children() > 0 && !Skipped())
        TreeViewNode->SetImage("openedBook");
}

void CHelpPrjTreeNode::Collapse() {
    if (TreeViewNode != nullptr && !Skipped())
        TreeViewNode->SetImage(Icon());
}

bool CHelpPrjTreeNode::KeyDown(std::int32_t KeyCode, std::int32_t Shift, const CHelpPrjTreeNode* robjParent) {
    if (KeyCode != kInsertKey)
        return false;
    SetSkipped(robjParent == nullptr ? !Skipped() : robjParent->Skipped());
    if (TreeViewNode != nullptr)
        TreeViewNode->SetImage(Skipped() ? std::string("no") : Icon());
    for (const auto& child : children_)
        child->KeyDown(KeyCode, Shift, this);
    return true;
}

void CHelpPrjTreeNode::SetNodeCaption(const std::string& vstrCaption) {
    if (TreeViewNode != nullptr)
        TreeViewNode->SetText(vstrCaption);
}

void CHelpPrjTreeNode::SwitchNameCaption(bool vfUseCaption) {
    for (const auto& child : children_) {
        const auto name = child->Name();
        if (!name.empty()) {
            const auto shown = vfUseCaption ? child->Caption() : name;
            if (!shown.empty())
                child->SetNodeCaption(shown);
        }
        child->SwitchNameCaption(vfUseCaption);
    }
}

void CHelpPrjTreeNode::SetFormsReportsProcessCode(std::int32_t vlngProcessCode) {
    for (const auto& child : children_) {
        if (child->HasSerializer())
            continue;
        const auto caption = child->Caption();
        for (const char* group : {"Reports", "Forms", "Dialogs"})
            if (text::EqualsIgnoringCase(caption, group))
                child->SetFormsReportsProcessCode(999);
        if (vlngProcessCode != -1)
            child->SetProcessCode(vlngProcessCode);
    }
}

} // namespace tovimar
