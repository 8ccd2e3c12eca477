#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "project/CHelpPrjCheckSums.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/SitemapText.h"
#include "topics/CFormHTMLControlDef.h"
#include "topics/CFormHtmlTemplates.h"
#include "uimodel/CXmlForm.h"

/// Definitions of the objects, the control nodes made from them, and the checksums of their topics.
namespace tovimar {

namespace {

std::string XmlFormPathOfNode(const CHelpPrjTreeNode& node, bool external, const std::string& treeFile) {
    const auto* project = Session::CurrentProject();
    if (external || project == nullptr)
        return platform::FolderOf(treeFile) + "xml\\" + node.XmlFormFileName();
    return platform::Join(project->XmlFormsFolder(), node.XmlFormFileName());
}

} // namespace

std::shared_ptr<CXmlForm> CHelpPrjTree::MakeXmlFormControlDefs(CHelpPrjTreeNode& node, bool external,
                                                               const std::string& treeFile, bool& changed) {
    changed = false;
    std::shared_ptr<CXmlForm> form;
    Trapped("CHelpPrjTree", "MakeXmlFormControlDefs", [&] {
        const auto path = XmlFormPathOfNode(node, external, treeFile);
        form = definitions_.Load(path);
        // Without its topic an object keeps the controls that it had.
        if (form == nullptr || !platform::Env().files->FileExists(form->HtmlFullPath()))
            return;
        if (form->MakeDefs(form->HtmlFullPath(), /*vfDoNotReplaceDefsIfTheSame=*/true) == 1)
            return;
        definitions_.Save(form, path);
        changed = true;
    });
    return form;
}

std::shared_ptr<CXmlForm> CHelpPrjTree::AddControls(CHelpPrjTreeNode& node, std::int32_t& level,
                                                    bool external, const std::string& treeFile) {
    std::shared_ptr<CXmlForm> form;
    Trapped("CHelpPrjTree", "AddControls", [&] {
        bool changed = false;
        form = MakeXmlFormControlDefs(node, external, treeFile, changed);
        if (form == nullptr)
            return;
        ++level;
        for (const auto& entry : form->DocumentedMenus)
            AddControlNode(node, level, *form, *entry, /*isMenu=*/true);
        for (const auto& entry : form->DocumentedControls)
            AddControlNode(node, level, *form, *entry, form->GetMenu(entry->BookmarkName) != nullptr);
        --level;
    });
    return form;
}

void CHelpPrjTree::AddControlNode(CHelpPrjTreeNode& object, std::int32_t level, const CXmlForm& form,
                                  const CFormHTMLControlDef& entry, bool isMenu) {
    auto node = std::make_unique<CHelpPrjTreeNode>();
    node->HelpPrjTree = this;
    node->Level = level;
    node->Tag = isMenu ? "MenuItem" : "Control";
    node->IsMenu = isMenu;
    node->IsControl = !isMenu;
    node->SetKey(object.Key() + "." + entry.BookmarkName);
    node->SetGeneratedHTMLFile(form.HtmlFullPath());
    node->SetBookmark(CFormHtmlTemplates().BookmarkNameForDocumentedMenuOrControl(form, entry));
    node->SetName(entry.ControlName);
    node->SetCaption(IdentifiedByName() ? entry.ControlName : entry.TopicCaption);
    node->SetIcon(object.Skipped() ? "no" : "helptopic");
    node->Parent = &object;
    addItem(&object, std::move(node), /*vfAutoUniqueKey=*/isMenu, nullptr, nullptr,
            /*vfAddChildNodesToMap=*/true);
}

std::shared_ptr<CXmlForm> CHelpPrjTree::AddControlsIfAbsent(CHelpPrjTreeNode& node, std::int32_t& level,
                                                            bool external, const std::string& treeFile) {
    auto form = definitions_.Load(XmlFormPathOfNode(node, external, treeFile));
    if (form == nullptr || !form->DocumentedControls.Empty() || !form->DocumentedMenus.Empty())
        return form;
    node.DropChildrenControls();
    return AddControls(node, level, external, treeFile);
}

void CHelpPrjTree::InitCheckSums(const std::string& path) {
    if (checkSums_ == nullptr)
        checkSums_ = std::make_unique<CHelpPrjCheckSums>();
    if (checkSums_->Initialized())
        return;
    auto folder = platform::FolderOf(path);
    auto name = platform::BaseNameOf(path);
    const auto* data = Session::ServerData();
    const auto* project = Session::CurrentProject();
    const auto* parameters = Session::Parameters();
    if (data != nullptr && !data->Runtime && project != nullptr && parameters != nullptr) {
        folder = project->Folder;
        name = parameters->HelpProjectName();
    }
    if (checkSums_->Init(folder, folder, name) == kSuccess && platform::Env().files->FolderExists(folder))
        checkSums_->Recalc();
}

ResultCode CHelpPrjTree::SaveCheckSums(bool vfSaveCurrentCheckSum) {
    InitCheckSums({});
    return checkSums_->Save(vfSaveCurrentCheckSum);
}

CHelpPrjFileCheckSum* CHelpPrjTree::GetCheckSumObject(const std::string& vstrFileFullPath) {
    if (checkSums_ == nullptr || vstrFileFullPath.empty())
        return nullptr;
    return &checkSums_->GetCheckSumObject(vstrFileFullPath, /*vfRecalc=*/true);
}

void CHelpPrjTree::RecalcCheckSums() {
    if (checkSums_ != nullptr)
        Trapped("CHelpPrjTree", "RecalcCheckSums", [&] { checkSums_->Recalc(); });
}

} // namespace tovimar
