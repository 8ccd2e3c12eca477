#include "project/CHelpPrjTree.h"

#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/contract/IClassFactory.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjCheckSums.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"

#include <array>
#include <utility>

namespace tovimar {

namespace {

constexpr const char* kObjectTags[] = {"Form", "Report", "Table", "Query", "Macro", "Worksheet", "Chart"};

} // namespace

CHelpPrjTree::CHelpPrjTree() = default;
CHelpPrjTree::~CHelpPrjTree() = default;

void CHelpPrjTree::Reset() {
    map_.Clear();
    index_.Forget();
    unplaced_.clear();
    root_.reset();
}

std::unique_ptr<CHelpPrjTreeNode> CHelpPrjTree::TakeRoot() {
    if (root_ != nullptr)
        root_->RemoveKeysFromKeyMap();
    index_.Forget();
    return std::move(root_);
}

void CHelpPrjTree::Terminate(bool vfKeepChildrenNodes, bool vfKeepRootNode) {
    if (terminated_)
        return;
    terminated_ = true;
    map_.Clear();
    index_.Forget();
    if (root_ != nullptr && !root_->Children().Empty()) {
        if (!vfKeepChildrenNodes)
            root_->ClearChildrenCollection();
        if (!vfKeepChildrenNodes && !vfKeepRootNode)
            root_->Terminate();
    }
    unplaced_.clear();
    root_.reset();
    document_.reset();
    TreeView = nullptr;
    if (checkSums_ != nullptr)
        checkSums_->Terminate();
}

std::int32_t CHelpPrjTree::NodesQty() const {
    return root_ == nullptr ? 0 : root_->NodesQty();
}

void CHelpPrjTree::Traverse(bool vfSkipSerializers) const {
    if (root_ != nullptr)
        root_->Traverse(vfSkipSerializers);
}

void CHelpPrjTree::ExpandSerializerNodes(IClassFactory& rIClassFactory, IHelpPrjSourceProject* rprj) {
    ForgetSourceProject();
    if (root_ != nullptr)
        root_->ExpandSerializerNodes(rIClassFactory, *this, rprj);
}

const std::string& CHelpPrjTree::SourceProjectLocation() {
    AskSourceProject();
    return sourceProjectLocation_;
}

const std::string& CHelpPrjTree::SourceProjectName() {
    AskSourceProject();
    return sourceProjectName_;
}

void CHelpPrjTree::AskSourceProject() {
    auto* agent = Session::ServerAgent();
    if (sourceProjectKnown_ || agent == nullptr)
        return;
    sourceProjectKnown_ = true;
    sourceProjectLocation_ = agent->CurrentSourceProjectLocation();
    if (sourceProjectLocation_.empty())
        sourceProjectLocation_ = platform::Env().folders.temporary;
    sourceProjectName_ = agent->CurrentSourceProjectName();
}

void CHelpPrjTree::DisplayInTreeview(ITreeView* rtvw, bool vfSkipSerializers) {
    Trapped("CHelpPrjTree", "DisplayInTreeview", [&] {
        if (rtvw == nullptr)
            return;
        ForgetSourceProject();
        rtvw->ClearNodes();
        TreeView = rtvw;
        if (root_ == nullptr)
            return;
        root_->DisplayInTreeview(rtvw, this, vfSkipSerializers);
        if (root_->TreeViewNode != nullptr) {
            root_->TreeViewNode->SetExpanded(true);
            root_->TreeViewNode->SetImage("openedBook");
        }
    });
}

void CHelpPrjTree::LeaveTreeview() {
    TreeView = nullptr;
    for (auto* node : map_) {
        node->TreeView = nullptr;
        node->TreeViewNode = nullptr;
    }
}

void CHelpPrjTree::Collapse(ITreeViewNode* node) {
    if (auto* found = node == nullptr ? nullptr : MapItem(node->Key()))
        found->Collapse();
}

void CHelpPrjTree::Expand(ITreeViewNode* node) {
    if (auto* found = node == nullptr ? nullptr : MapItem(node->Key()))
        found->Expand();
}

bool CHelpPrjTree::KeyDown(std::int32_t& KeyCode, std::int32_t& Shift) {
    const auto* selected = TreeView == nullptr ? nullptr : TreeView->SelectedItem();
    auto* node = selected == nullptr ? nullptr : MapItem(selected->Key());
    return node != nullptr && node->Parent != nullptr && node->KeyDown(KeyCode, Shift);
}

void CHelpPrjTree::SetNodeCaption(const std::string& vstrNodeKey, const std::string& vstrCaption) {
    if (auto* node = MapItem(vstrNodeKey))
        node->SetNodeCaption(vstrCaption);
}

bool CHelpPrjTree::TopicSkipped(const std::string& vstrNodeKey) const {
    const auto* node = MapItem(vstrNodeKey);
    return node != nullptr && node->Skipped();
}

KeyedList<std::string> CHelpPrjTree::GetFilesHTMLCollection() const {
    KeyedList<std::string> files;
    if (root_ != nullptr)
        root_->GetHtmlFilesCollection(files);
    return files;
}

std::string CHelpPrjTree::GetNodeHtmlRef(const std::string& vstrObjName,
                                         const std::string& vstrObjTypeName) const {
    return root_ == nullptr ? NormalizeName(vstrObjName)
                            : root_->GetNodeHtmlRef(vstrObjName, vstrObjTypeName);
}

std::string CHelpPrjTree::GetNodeHtmlFileNameNoExt(const std::string& vstrObjName,
                                                   const std::string& vstrObjTypeName) const {
    return root_ == nullptr ? NormalizeName(vstrObjName)
                            : root_->GetNodeHtmlFileNameNoExt(vstrObjName, vstrObjTypeName);
}

bool CHelpPrjTree::HtmlFileNameIsUsed(const std::string& vstrHTMLFileNameNoExt) const {
    return root_ != nullptr && root_->HtmlFileNameIsUsed(vstrHTMLFileNameNoExt);
}

bool CHelpPrjTree::IsObjectTag(const std::string& tag) {
    for (const char* known : kObjectTags)
        if (text::EqualsIgnoringCase(tag, known))
            return true;
    return false;
}

void CHelpPrjTree::CollectObjectNodes(std::vector<CHelpPrjTreeNode*>& list, CHelpPrjTreeNode* start) const {
    auto* node = start != nullptr ? start : root_.get();
    if (node == nullptr)
        return;
    if (IsObjectTag(node->Tag))
        list.push_back(node);
    for (const auto& child : node->Children())
        CollectObjectNodes(list, child.get());
}

bool CHelpPrjTree::IsGroupTemplateNode(const CHelpPrjTreeNode& node) {
    const auto file = node.TemplateHtmlFile();
    for (const char* known : {"dialogs.htm", "forms.htm", "reports.htm", "macros.htm", "tables.htm",
                              "queries.htm", "worksheets.htm", "charts.htm"})
        if (text::EqualsIgnoringCase(file, known))
            return true;
    return false;
}

void CHelpPrjTree::SyncGenerateFlagsFromTree(const CHelpPrjTreeNode* start) const {
    const auto* node = start != nullptr ? start : root_.get();
    auto* parameters = Session::Parameters();
    if (node == nullptr || parameters == nullptr)
        return;
    const std::array<std::pair<const char*, bool*>, 6> flags = {{
        {"dialogs.htm", &parameters->GenerateHelpForForms},
        {"forms.htm", &parameters->GenerateHelpForForms},
        {"reports.htm", &parameters->GenerateHelpForReports},
        {"macros.htm", &parameters->GenerateHelpForMacros},
        {"tables.htm", &parameters->GenerateHelpForTables},
        {"queries.htm", &parameters->GenerateHelpForQueries},
    }};
    const auto file = node->TemplateHtmlFile();
    for (const auto& [name, flag] : flags)
        if (text::EqualsIgnoringCase(file, name))
            *flag = !node->Skipped();
    for (const auto& child : node->Children())
        SyncGenerateFlagsFromTree(child.get());
}

} // namespace tovimar
