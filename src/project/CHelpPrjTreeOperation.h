#pragma once

#include "platform/Error.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace tovimar {

class CHelpPrjTree;
class CHelpPrjTreeOperation;
class ITreeView;

/// Operations that were carried out, the oldest first.
using TreeOperationList = std::vector<std::shared_ptr<CHelpPrjTreeOperation>>;

/// One edit of the contents, and what it takes to undo it. Every change of the structure goes through a
/// node's pasting and ending, which keep tree, key map and view in step; of the view only the selection is
/// read. An edit needs a view.
class CHelpPrjTreeOperation {
public:
    /// "Cut", "Copy", "Paste", "Paste Special", "Delete", "Up", "Down", "Left", "Right", "MoveNode", "New",
    /// "Add", "Edit Node Index", "Toggle Skipped Flag", "HHC", "XML", "Undo".
    std::string OpCode;
    /// The clipboard's text; what "Copy" and "XML" give.
    std::string XMLSTr;
    std::string HHCStr;
    /// What was touched, as a node's text.
    std::string OperationAffectedXML;
    /// Why it wasn't carried out; mostly empty.
    std::string ErrMessage;
    ResultCode RetCode = kSuccess;
    // Of "MoveNode".
    std::string SourceNodeKey;
    std::string TargetNodeKey;
    std::string SourceNodeParentKey;

    void Init(ITreeView* rtvw, CHelpPrjTree* robjHelpPrjTree, const std::string& vstrXmlStr);
    /// 0, or kGeneralFailure for one that wasn't carried out. Works on the source node, without a key on the
    /// selected one. `vvarParam1` is the page of "Add" and the default title of "New"; `rvarParam1` takes the
    /// title that was given. "Undo" takes entries off `rcolOpStack`.
    ResultCode ExecuteOperation(const std::string& vstrOpCode, TreeOperationList& rcolOpStack,
                                const std::string& vstrSourceNodeKey = {},
                                const std::string& vstrTargetNodeKey = {},
                                const std::string& vstrSourceNodeParentKey = {},
                                const std::optional<std::string>& vvarParam1 = {},
                                std::string* rvarParam1 = nullptr);
    void Terminate();

private:
    ITreeView* view_ = nullptr;
    CHelpPrjTree* tree_ = nullptr;
};

} // namespace tovimar
