#include "foundation/CAddInProject.h"
#include "foundation/Session.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/TreeEdit.h"
#include "project/frmHHCEntryIndexKeywords.h"
#include "uimodel/CXmlControl.h"
#include "uimodel/CXmlForm.h"
#include "uimodel/CXmlMenu.h"

#include <vector>

/// The index entries of one node.
namespace tovimar {
namespace {

bool IsSection(const CHelpPrjTreeNode& node) {
    return node.IsControl || node.IsMenu;
}

bool IsObject(const CHelpPrjTreeNode& node) {
    const auto type = node.ObjectType();
    return (type >= 0 && type <= 4) || type == 81 || type == 82;
}

/// The entries of an object and of its sections stand in its definition, those of a page in its node.
class IndexEntries {
public:
    explicit IndexEntries(CHelpPrjTree& tree, CHelpPrjTreeNode& node) : tree_(tree), node_(node) {
        if (!IsSection(node) && !IsObject(node))
            return;
        const auto* project = Session::CurrentProject();
        path_ = platform::Join(project == nullptr ? std::string() : project->XmlFormsFolder(),
                               node.XmlFormFileName());
        form_ = tree.Definitions().Load(path_);
        if (form_ != nullptr)
            text_ = TextIn(*form_);
    }
    bool InDefinition() const { return form_ != nullptr || IsSection(node_); }

    KeyedList<std::string> Read() const {
        if (!InDefinition())
            return node_.IndexesCollection();
        KeyedList<std::string> entries;
        if (text_ != nullptr)
            for (const std::string& word : text::Split(*text_, "|"))
                if (!word.empty() && !entries.Contains(word))
                    entries.Add(word, word);
        return entries;
    }
    void Write(const KeyedList<std::string>& entries) {
        if (!InDefinition()) {
            node_.SetIndexesCollection(entries);
            return;
        }
        if (text_ == nullptr)
            return;
        std::vector<std::string> words;
        for (const std::string& word : entries)
            words.push_back(word);
        *text_ = text::Join(words, "|");
        tree_.Definitions().Save(form_, path_);
    }

private:
    std::string* TextIn(CXmlForm& form) const {
        if (node_.IsControl) {
            auto* control = form.GetControl(node_.Name());
            return control == nullptr ? nullptr : &control->Indexes;
        }
        if (node_.IsMenu) {
            auto* menu = form.GetMenu(node_.Name());
            return menu == nullptr ? nullptr : &menu->Indexes;
        }
        return &form.Indexes;
    }

    CHelpPrjTree& tree_;
    CHelpPrjTreeNode& node_;
    std::string path_;
    std::shared_ptr<CXmlForm> form_;
    std::string* text_ = nullptr; ///< in the form; null for what it doesn't hold
};

/// Its entry among what can be undone is used up and brings nothing back.
class IndexEdit : public TreeEdit {
public:
    const char* Name() const override { return "EditNodeIndex"; }
    bool Run(TreeEditRun& run) const override {
        if (run.node == nullptr || !frmHHCEntryIndexKeywords::ShowDialog)
            return false;
        IndexEntries entries(run.tree, *run.node);
        frmHHCEntryIndexKeywords dialog;
        dialog.SetIndexesCollection(entries.Read());
        frmHHCEntryIndexKeywords::ShowDialog(dialog);
        if (!dialog.Accepted())
            return false;
        if (!entries.InDefinition())
            run.operation.OperationAffectedXML =
                text::Trim(run.node->XMLSTr(1, /*vfSkipSerializers=*/true, /*vfExtInfo=*/true,
                                            /*vfIncludeXMLHeader=*/false, {}));
        entries.Write(dialog.IndexesCollection());
        run.Succeed();
        return true;
    }
};

} // namespace

const TreeEdit* IndexEditOf(const std::string& opCode) {
    static const IndexEdit edit;
    return text::EqualsIgnoringCase(opCode, "Edit Node Index") ? &edit : nullptr;
}

} // namespace tovimar
