#include "project/CHelpPrjTreeOperation.h"

#include "foundation/ErrorTrap.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/TreeEdit.h"

namespace tovimar {

void CHelpPrjTreeOperation::Init(ITreeView* rtvw, CHelpPrjTree* robjHelpPrjTree,
                                 const std::string& vstrXmlStr) {
    view_ = rtvw;
    tree_ = robjHelpPrjTree;
    XMLSTr = vstrXmlStr;
}

ResultCode CHelpPrjTreeOperation::ExecuteOperation(
    const std::string& vstrOpCode, TreeOperationList& rcolOpStack, const std::string& vstrSourceNodeKey,
    const std::string& vstrTargetNodeKey, const std::string& vstrSourceNodeParentKey,
    const std::optional<std::string>& vvarParam1, std::string* rvarParam1) {
    RetCode = kGeneralFailure;
    ErrMessage.clear();
    const auto* edit = TreeEditOf(vstrOpCode);
    if (edit == nullptr || view_ == nullptr || tree_ == nullptr)
        return RetCode;
    SourceNodeKey = vstrSourceNodeKey;
    TargetNodeKey = vstrTargetNodeKey;
    SourceNodeParentKey = vstrSourceNodeParentKey;
    bool changed = false;
    const ResultCode failed = Trapped("CHelpPrjTreeOperation", edit->Name(), [&] {
        TreeEditRun run(*this, *view_, *tree_, rcolOpStack);
        run.parameter = vvarParam1;
        run.answer = rvarParam1;
        changed = edit->Run(run);
    });
    if (failed != kSuccess)
        RetCode = kGeneralFailure;
    // What a failed edit has done up to then may have changed the tree.
    tree_->WasChanged = tree_->WasChanged || changed || (failed != kSuccess && edit->ChangesStructure());
    return RetCode;
}

void CHelpPrjTreeOperation::Terminate() {
    view_ = nullptr;
    tree_ = nullptr;
}

} // namespace tovimar
