#pragma once

#include "platform/Error.h"
#include "project/CHelpPrjTreeOperation.h"

#include <cstddef>
#include <optional>
#include <string>

namespace tovimar {

class CHelpPrjTree;
class CHelpPrjTreeNode;
class ITreeView;
class ITreeViewNode;

/// The one road for what a user changes in the contents. It tells what is forbidden, has the operations run
/// on the selected node, and keeps the last sixteen that succeeded for undo. Copies, texts and undos take
/// places among these, too.
class clsTreeViewManipulator {
public:
    /// Of the last operation: 0 when it was carried out.
    ResultCode RetCode = kSuccess;

    /// Neither is owned.
    void Init(ITreeView* rtvw, CHelpPrjTree* robjHelpPrjTree);
    /// A second call does nothing.
    void Terminate();
    std::size_t UndoStackLength() const { return rcolOpStack_.size(); }

    void Cut() { Execute("Cut"); }
    void Copy() { Execute("Copy"); }
    void Delete() { Execute("Delete"); }
    void Up() { Execute("Up"); }
    void Down() { Execute("Down"); }
    void Left() { Execute("Left"); }
    void Right() { Execute("Right"); }
    void Edit() { Execute("Edit"); }
    void Paste() { Execute("Paste"); }
    void PasteSpecial() { Execute("Paste Special"); }
    void Undo() { Execute("Undo"); }
    void ToggleSkippedFlag() { Execute("Toggle Skipped Flag"); }
    void EditIndex() { Execute("Edit Node Index"); }
    /// `rstrName` takes the title that the user gave.
    void AddNew(const std::string& vstrDefaultName, std::string& rstrName);
    void AddSelected(const std::string& vstrHtmlToAddFullPath);
    /// The source becomes the last child of the target. 0x80040001 while another operation runs.
    ResultCode MoveNode(ITreeViewNode* robjTargetParentNode, ITreeViewNode* robjSourceNode);
    /// Contents entries and XML of the selected node; empty when that failed.
    std::string GetHHC();
    std::string GetXML();

private:
    struct Request;

    /// The operation; null when it was forbidden.
    std::shared_ptr<CHelpPrjTreeOperation> Execute(const std::string& code);
    std::shared_ptr<CHelpPrjTreeOperation> Execute(const Request& request);
    std::shared_ptr<CHelpPrjTreeOperation> Run(const Request& request);
    const CHelpPrjTreeNode* NodeOf(const std::string& key) const;
    std::string WhyForbidden(const Request& request) const;
    bool Refuses(const Request& request) const;
    void Record(const std::shared_ptr<CHelpPrjTreeOperation>& operation);

    ITreeView* view_ = nullptr;
    CHelpPrjTree* tree_ = nullptr;
    std::string clipboardXml_;
    TreeOperationList rcolOpStack_;
    bool terminated_ = false;
    bool busy_ = false;
};

} // namespace tovimar
