#include "project/clsTreeViewManipulator.h"

#include "foundation/Beep.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/ShowMessage.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "clsTreeViewManipulator";
constexpr std::size_t kMostUndo = 16;

constexpr const char* kNoChildren =
    "Forbidden operation for controls: control can't have manually assigned children nodes.";
constexpr const char* kNoMoving =
    "Forbidden operation for controls: controls can't be copied, moved or deleted.";
constexpr const char* kNoTarget =
    "Forbidden operation for controls: control can't be a target of copy, move or paste operation.";

bool IsSection(const CHelpPrjTreeNode* node) {
    return node != nullptr && (node->IsControl || node->IsMenu);
}

void Tell(const std::string& text, const char* source) {
    ShowMessage(text, kMsgExclamation, kApplicationTitle, {}, 0, source);
}

bool IsWithin(const ITreeViewNode* subtree, const ITreeViewNode* entry) {
    for (; entry != nullptr; entry = entry->Parent())
        if (entry == subtree)
            return true;
    return false;
}

/// A message box lets a second click arrive while an operation runs; it is dropped.
class Busy {
public:
    explicit Busy(bool& flag) : flag_(flag) { flag_ = true; }
    ~Busy() { flag_ = false; }
    Busy(const Busy&) = delete;
    Busy& operator=(const Busy&) = delete;

private:
    bool& flag_;
};

} // namespace

struct clsTreeViewManipulator::Request {
    std::string code;
    std::string source = {};
    std::string target = {};
    std::string sourceParent = {};
    std::optional<std::string> parameter = {};
    std::string* answer = nullptr;
};

void clsTreeViewManipulator::Init(ITreeView* rtvw, CHelpPrjTree* robjHelpPrjTree) {
    view_ = rtvw;
    tree_ = robjHelpPrjTree;
    terminated_ = false;
}

void clsTreeViewManipulator::Terminate() {
    if (terminated_)
        return;
    terminated_ = true;
    for (const auto& operation : rcolOpStack_)
        operation->Terminate();
    rcolOpStack_.clear();
    clipboardXml_.clear();
    view_ = nullptr;
    tree_ = nullptr;
}

const CHelpPrjTreeNode* clsTreeViewManipulator::NodeOf(const std::string& key) const {
    return key.empty() || tree_ == nullptr ? nullptr : tree_->MapItem(key);
}

/// Empty for what isn't forbidden, and for a forbidden request that needs no word.
std::string clsTreeViewManipulator::WhyForbidden(const Request& request) const {
    const auto* selected = view_ == nullptr ? nullptr : view_->SelectedItem();
    if (selected != nullptr && IsSection(NodeOf(selected->Key())) && request.code != "Edit Node Index") {
        if (request.code == "Toggle Skipped Flag")
            return {};
        return request.code == "New" ? kNoChildren : kNoMoving;
    }
    if (IsSection(NodeOf(request.source)))
        return kNoMoving;
    return IsSection(NodeOf(request.target)) ? kNoTarget : std::string();
}

bool clsTreeViewManipulator::Refuses(const Request& request) const {
    const std::string why = WhyForbidden(request);
    const auto* selected = view_ == nullptr ? nullptr : view_->SelectedItem();
    const bool silent =
        request.code == "Toggle Skipped Flag" && selected != nullptr && IsSection(NodeOf(selected->Key()));
    if (why.empty() && !silent)
        return false;
    Beep();
    if (!why.empty())
        Tell(why, "clsTreeViewManipulator.ExecuteOperation");
    return true;
}

std::shared_ptr<CHelpPrjTreeOperation> clsTreeViewManipulator::Execute(const std::string& code) {
    return Execute(Request{code});
}

std::shared_ptr<CHelpPrjTreeOperation> clsTreeViewManipulator::Execute(const Request& request) {
    if (busy_ || terminated_)
        return nullptr;
    const Busy busy(busy_);
    RetCode = kGeneralFailure;
    std::shared_ptr<CHelpPrjTreeOperation> operation;
    Trapped(kClass, "ExecuteOperation", [&] {
        if (!Refuses(request))
            operation = Run(request);
    });
    return operation;
}

std::shared_ptr<CHelpPrjTreeOperation> clsTreeViewManipulator::Run(const Request& request) {
    RetCode = -1;
    auto operation = std::make_shared<CHelpPrjTreeOperation>();
    operation->OpCode = request.code;
    operation->Init(view_, tree_, clipboardXml_);
    RetCode = operation->ExecuteOperation(request.code, rcolOpStack_, request.source, request.target,
                                          request.sourceParent, request.parameter, request.answer);
    if (RetCode != kSuccess && !operation->ErrMessage.empty()) {
        Beep();
        Tell(operation->ErrMessage, "clsTreeViewManipulator.ExecuteOperation");
    }
    if (RetCode == kSuccess)
        Record(operation);
    return operation;
}

void clsTreeViewManipulator::Record(const std::shared_ptr<CHelpPrjTreeOperation>& operation) {
    if (operation->OpCode == "Copy" || operation->OpCode == "Cut")
        clipboardXml_ = operation->XMLSTr;
    rcolOpStack_.push_back(operation);
    if (rcolOpStack_.size() > kMostUndo)
        rcolOpStack_.erase(rcolOpStack_.begin());
}

void clsTreeViewManipulator::AddNew(const std::string& vstrDefaultName, std::string& rstrName) {
    Request request{"New"};
    request.parameter = vstrDefaultName;
    request.answer = &rstrName;
    Execute(request);
}

void clsTreeViewManipulator::AddSelected(const std::string& vstrHtmlToAddFullPath) {
    Request request{"Add"};
    request.parameter = vstrHtmlToAddFullPath;
    Execute(request);
}

ResultCode clsTreeViewManipulator::MoveNode(ITreeViewNode* robjTargetParentNode,
                                            ITreeViewNode* robjSourceNode) {
    if (robjTargetParentNode == nullptr || robjSourceNode == nullptr || robjSourceNode->Parent() == nullptr)
        return kGeneralFailure;
    if (IsWithin(robjSourceNode, robjTargetParentNode)) {
        Tell("Node cannot be moved!", "clsTreeViewManipulator.MoveNode");
        return kGeneralFailure;
    }
    if (busy_)
        return kFailure1;
    Request request{"MoveNode"};
    request.source = robjSourceNode->Key();
    request.target = robjTargetParentNode->Key();
    request.sourceParent = robjSourceNode->Parent()->Key();
    Execute(request);
    return RetCode;
}

std::string clsTreeViewManipulator::GetHHC() {
    const auto operation = Execute("HHC");
    return operation != nullptr && RetCode == kSuccess ? operation->HHCStr : std::string();
}

std::string clsTreeViewManipulator::GetXML() {
    const auto operation = Execute("XML");
    return operation != nullptr && RetCode == kSuccess ? operation->XMLSTr : std::string();
}

} // namespace tovimar
