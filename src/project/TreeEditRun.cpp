#include "foundation/CXMLFile.h"
#include "foundation/Product.h"
#include "foundation/ShowMessage.h"
#include "foundation/TextEncodings.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"
#include "project/SitemapText.h"
#include "project/TreeEdit.h"

/// The steps that the kinds of edit share.
namespace tovimar {
namespace {

constexpr std::uint32_t kDeleteQuestion = kMsgYesNoCancel | kMsgQuestion | kMsgDefaultThird;

std::string TextOf(CHelpPrjTreeNode& node) {
    return text::Trim(node.XMLSTr(1, /*vfSkipSerializers=*/true, /*vfExtInfo=*/true,
                                  /*vfIncludeXMLHeader=*/false, {}));
}

} // namespace

TreeEditRun::TreeEditRun(CHelpPrjTreeOperation& ofOperation, ITreeView& onView, CHelpPrjTree& onTree,
                         TreeOperationList& ofUndo)
    : operation(ofOperation), view(onView), tree(onTree), undoList(ofUndo) {
    if (!operation.SourceNodeKey.empty())
        node = tree.MapItem(operation.SourceNodeKey);
    else if (const auto* selected = view.SelectedItem())
        node = tree.MapItem(selected->Key());
}

void TreeEditRun::Tell(const std::string& text, const char* source) {
    ShowMessage(text, kMsgExclamation, kApplicationTitle, {}, 0, source);
}

void TreeEditRun::Select(CHelpPrjTreeNode& selected) const {
    if (selected.TreeViewNode != nullptr)
        selected.TreeViewNode->SetSelected(true);
}

void TreeEditRun::Copy() {
    if (node == nullptr)
        return;
    node->SetOriginalKey(node->Key());
    if (node->Parent != nullptr)
        node->SetParentOriginalKey(node->Parent->Key());
    operation.XMLSTr = operation.OperationAffectedXML = TextOf(*node);
    Succeed();
}

void TreeEditRun::TakeOut() {
    operation.OperationAffectedXML = TextOf(*node);
    node->Terminate();
    node = nullptr;
    Succeed();
}

void TreeEditRun::Delete(bool silent) {
    if (node == nullptr)
        return;
    if (node == tree.Root()) {
        if (!silent)
            Tell("Root node cannot be deleted!", "CHelpPrjTreeOperation.Delete");
        return;
    }
    const std::string page = node->GeneratedHTMLFileFullPath();
    const int reply =
        silent ? static_cast<int>(platform::kAnswerNo)
               : ShowMessage(std::string("Delete action removes the node from the contents "
                                         "tree.") +
                                 kCrLf + "Do you also want to delete the corresponding HTML page?",
                             kDeleteQuestion, kApplicationTitle, {}, 0, "CHelpPrjTreeOperation.Delete");
    if (reply != platform::kAnswerYes && reply != platform::kAnswerNo)
        return;
    TakeOut();
    auto& files = *platform::Env().files;
    if (reply == platform::kAnswerYes && !page.empty() && files.FileExists(page))
        files.DeleteFile(page);
}

std::unique_ptr<CHelpPrjTree> TreeEditRun::LoadPiece(const std::string& xml) {
    if (xml.empty())
        return nullptr;
    auto piece = std::make_unique<CHelpPrjTree>();
    if (piece->Load({}, /*vfNewHtmlHelpProject=*/true, /*vfLoadingExternalProject=*/false, xml,
                    /*vfLoadControls=*/true) != kSuccess ||
        piece->Root() == nullptr)
        return nullptr;
    return piece;
}

void TreeEditRun::Paste(CHelpPrjTree& piece, const PastePlace& place, bool pasteChildren, bool keepKeys) {
    if (!keepKeys)
        piece.Root()->AssignNewKeysToAllNodesIfDuplicateInANewTree(&tree, /*vfSkipSerializers=*/true);
    if (!pasteChildren)
        piece.Root()->ClearChildrenCollection();
    auto* placed = CHelpPrjTreeNode::Paste(piece.TakeRoot(), place.parent, &view, &tree, place.previous,
                                           place.next, place.beforePrevious, place.afterNext);
    piece.Terminate(/*vfKeepChildrenNodes=*/true, /*vfKeepRootNode=*/false);
    if (placed == nullptr)
        return;
    node = placed;
    Select(*placed);
    operation.OperationAffectedXML = TextOf(*placed);
    Succeed();
}

void TreeEditRun::Relocate(const PastePlace& place, bool keepKeys) {
    Copy();
    const auto piece = LoadPiece(operation.XMLSTr);
    operation.RetCode = kGeneralFailure;
    if (piece == nullptr || node == tree.Root())
        return;
    TakeOut();
    operation.RetCode = kGeneralFailure;
    Paste(*piece, place, /*pasteChildren=*/true, keepKeys);
}

void TreeEditRun::AddNode(const std::string& xml) {
    auto document = std::make_shared<XmlDocument>();
    CXMLFile file;
    if (const ResultCode result = file.LoadXml(xml, *document); result != kSuccess)
        throw RaisedError(result, file.XmlParseError.reason, "CHelpPrjTreeOperation");
    auto made = std::make_unique<CHelpPrjTreeNode>();
    made->Build(1, document, document->documentElement());
    made->AssignNewKeyIfDuplicate(&tree);
    auto* placed =
        CHelpPrjTreeNode::Paste(std::move(made), node, &view, &tree, nullptr, nullptr, false, false);
    if (placed == nullptr)
        throw RaisedError(kFailure1, "The new node can't be placed", "CHelpPrjTreeOperation");
    operation.OperationAffectedXML = TextOf(*placed);
    Select(*placed);
    Succeed();
}

} // namespace tovimar
