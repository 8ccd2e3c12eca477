#include "uimodel/CXmlForm.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/TextEncodings.h"
#include "platform/files/Paths.h"
#include "topics/CFormHTMLControlDefs.h"
#include "uimodel/ProjectPaths.h"

#include <unordered_set>

namespace tovimar {

namespace {

std::string DefKey(const CFormHTMLControlDef& def) {
    // No text of a topic holds a zero, so the parts can't run into each other.
    return def.ControlName + '\0' + def.BookmarkName + '\0' + def.TopicCaption;
}

bool SameDefs(const CXmlForm::DefList& oldDefs, const CXmlForm::DefList& newDefs) {
    if (oldDefs.Count() != newDefs.Count())
        return false;
    std::unordered_set<std::string> keys;
    for (const auto& def : newDefs)
        keys.insert(DefKey(*def));
    for (const auto& def : oldDefs)
        if (!keys.contains(DefKey(*def)))
            return false;
    return true;
}

void CollectControls(const CXmlControl::List& controls, std::vector<CXmlControl*>& found) {
    for (const auto& control : controls) {
        found.push_back(control.get());
        CollectControls(control->Controls, found);
    }
}

} // namespace

std::string CXmlForm::ZoomFactor = "0.8";

CXmlForm::~CXmlForm() {
    Terminate();
}

std::string CXmlForm::PicFullPath() const {
    return CompletedPath(picFullPath_);
}
std::string CXmlForm::HtmlFullPath() const {
    return CompletedPath(htmlFullPath_);
}
std::string CXmlForm::StylesheetFullPath() const {
    return stylesheetFullPath_.empty() ? std::string() : CompletedPath(stylesheetFullPath_);
}

std::string CXmlForm::Name4Xml() const {
    return EncodeXmlName(Name);
}
std::string CXmlForm::Text4Xml() const {
    return EncodeXmlText(Text);
}
std::string CXmlForm::NameNormalized() const {
    return NormalizeName(Name);
}
std::string CXmlForm::UniqueName() const {
    return platform::BaseNameOf(HtmlFullPath());
}
std::string CXmlForm::XmlFileName() const {
    return UniqueName() + ".xml";
}
std::string CXmlForm::PicLocalPath() const {
    return LocalPicturePath(picFullPath_);
}

const CXmlSection* CXmlForm::Section(const std::string& name) const {
    const auto* section = name.empty() ? nullptr : Sections.Find(name);
    return section == nullptr ? nullptr : section->get();
}

std::int32_t CXmlForm::ControlSectionOffsetX(const std::string& sectionName) const {
    const CXmlSection* section = Section(sectionName);
    return section == nullptr ? 0 : section->ClientAreaOffsetX;
}

std::int32_t CXmlForm::ControlSectionOffsetY(const std::string& sectionName) const {
    const CXmlSection* section = Section(sectionName);
    return section == nullptr ? 0 : section->ClientAreaOffsetY;
}

std::int32_t CXmlForm::ControlSectionHeaderHeight(const std::string& sectionName) const {
    const CXmlSection* section = Section(sectionName);
    return section == nullptr ? 0 : section->DesignTimeHeaderHeight;
}

Value CXmlForm::Properties(const std::string& name) const {
    if (name == "Name")
        return Name;
    if (name == "Caption")
        return Text;
    if (name == "HelpContextId")
        return HelpContextId;
    return {};
}

std::vector<CXmlControl*> CXmlForm::AllControls(std::vector<CXmlControl*> rcol, CXmlControl* rctl) const {
    CollectControls(rctl == nullptr ? Controls : rctl->Controls, rcol);
    return rcol;
}

CXmlControl* CXmlForm::GetControl(const std::string& vstrName, CXmlControl* rctl) const {
    if (rctl != nullptr) {
        for (CXmlControl* control : AllControls({}, rctl))
            if (control->NameNormalized() == vstrName)
                return control;
        return nullptr;
    }
    EnsureIndex();
    const auto found = controlsByName_.find(vstrName);
    return found == controlsByName_.end() ? nullptr : found->second;
}

CXmlMenu* CXmlForm::GetMenu(const std::string& vstrName) const {
    EnsureIndex();
    const auto found = menusByName_.find(vstrName);
    return found == menusByName_.end() ? nullptr : found->second;
}

void CXmlForm::EnsureIndex() const {
    if (indexed_)
        return;
    for (CXmlControl* control : AllControls())
        controlsByName_.try_emplace(control->NameNormalized(), control);
    for (const auto& menu : Menus)
        menusByName_.try_emplace(menu->NameNormalized(), menu.get());
    indexed_ = true;
}

void CXmlForm::ControlsChanged() {
    controlsByName_.clear();
    menusByName_.clear();
    indexed_ = false;
}

void CXmlForm::SortControlsUsingTabIndex() {
    Trapped("CXmlForm", "SortControlsUsingTabIndex", [&] {
        CXmlControl::SortList(Controls);
        ControlsChanged();
    });
}

ResultCode CXmlForm::MakeDefs(const std::string& vstrHtmlFileFullPath, bool vfDoNotReplaceDefsIfTheSame) {
    CFormHTMLControlDefs defs;
    const ResultCode read = defs.Parse(vstrHtmlFileFullPath);
    return read != kSuccess ? read : TakeDefs(defs, vfDoNotReplaceDefsIfTheSame);
}

ResultCode CXmlForm::MakeDefsFromText(const std::string& html, bool vfDoNotReplaceDefsIfTheSame) {
    CFormHTMLControlDefs defs;
    const ResultCode read = defs.ParseText(html);
    return read != kSuccess ? read : TakeDefs(defs, vfDoNotReplaceDefsIfTheSame);
}

ResultCode CXmlForm::TakeDefs(CFormHTMLControlDefs& defs, bool keepTheSame) {
    if (keepTheSame && SameDefs(DocumentedMenus, defs.Menus) && SameDefs(DocumentedControls, defs.Controls))
        return 1;
    DocumentedMenus = std::move(defs.Menus);
    DocumentedControls = std::move(defs.Controls);
    return kSuccess;
}

void CXmlForm::Terminate() {
    if (terminated_)
        return;
    terminated_ = true;
    ControlsChanged();
    for (auto& control : Controls)
        control->Terminate();
    for (auto& menu : Menus)
        menu->Terminate();
    for (auto& section : Sections)
        section->Terminate();
    Controls.Clear();
    Menus.Clear();
    Sections.Clear();
}

} // namespace tovimar
