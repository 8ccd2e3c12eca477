#include "uimodel/CXmlControl.h"

#include "foundation/NameEncoding.h"
#include "foundation/TextEncodings.h"
#include "platform/text/Text.h"
#include "uimodel/DefinitionText.h"
#include "uimodel/FreeKey.h"
#include "uimodel/ProjectPaths.h"

#include <algorithm>
#include <vector>

namespace tovimar {

using namespace definition;

namespace {

/// Attempts at a free bookmark; more controls of one name are no application's.
constexpr std::int32_t kMostAttempts = 1000;

} // namespace

void CXmlControl::SetControlType(const std::string& value) {
    controlType_ = value;
    if (elementName_.empty())
        elementName_ = value;
}

void CXmlControl::SetText(const std::string& value) {
    text_ = value;
    if (!value.empty())
        HasCaption = true;
}

std::string CXmlControl::HtmlBookMarkName() {
    if (bookmarkName_.empty())
        bookmarkName_ = Name;
    return text::ReplaceAll(bookmarkName_, " ", "_");
}

std::string CXmlControl::HtmlBookMarkName() const {
    return text::ReplaceAll(UniqueNameWithinXmlForm(), " ", "_");
}

std::string CXmlControl::Caption() const {
    std::string caption = text::Trim(text_);
    if (caption.size() > 1 && caption.back() == ':')
        caption.pop_back();
    return caption;
}

std::string CXmlControl::Name4Xml() const {
    return EncodeXmlName(Name);
}
std::string CXmlControl::Text4Xml() const {
    return EncodeXmlText(text_);
}
std::string CXmlControl::Description4Xml() const {
    return EncodeXmlText(Description);
}
std::string CXmlControl::Caption4Xml() const {
    return EncodeXmlText(Caption());
}
std::string CXmlControl::NameNormalized() const {
    return NormalizeName(Name);
}

bool CXmlControl::IsTabPage() const {
    return text::EqualsIgnoringCase(elementName_, "Page");
}
bool CXmlControl::IsTabControl() const {
    return text::EqualsIgnoringCase(elementName_, "TabControl");
}
bool CXmlControl::IsSubFormOrSubReport() const {
    return text::EqualsIgnoringCase(elementName_, "Subform") ||
           text::EqualsIgnoringCase(elementName_, "Subreport");
}

CXmlControl* CXmlControl::ParentControl() const {
    return Parent == nullptr || Parent->IsForm() ? nullptr : static_cast<CXmlControl*>(Parent);
}

std::string CXmlControl::PicLocalPath() const {
    return LocalPicturePath(PicFullPath);
}

bool CXmlControl::IsClass(const char* className) const {
    return text::EqualsIgnoringCase(ClassName(), className);
}

std::int32_t CXmlControl::ControlSectionOffsetX(const std::string& /*name*/) const {
    return Parent == nullptr ? 0 : Parent->ControlSectionOffsetX(ControlSectionName);
}

std::int32_t CXmlControl::ControlSectionOffsetY(const std::string& /*name*/) const {
    return Parent == nullptr ? 0 : Parent->ControlSectionOffsetY(ControlSectionName);
}

Value CXmlControl::Properties(const std::string& name) const {
    const auto is = [&](const char* known) { return text::EqualsIgnoringCase(name, known); };
    if (is("Name"))
        return Name;
    if (is("BookmarkName"))
        return HtmlBookMarkName();
    if (is("Text"))
        return text_;
    if (is("Width"))
        return Width;
    if (is("Height"))
        return Height;
    if (is("Top"))
        return Top;
    if (is("Left"))
        return Left;
    if (is("TabIndex"))
        return TabIndex;
    if (is("Visible"))
        return Visible;
    if (is("Index"))
        return Index;
    if (is("HelpContextId"))
        return HelpContextId;
    if (is("ClassName"))
        return ClassName();
    if (is("OriginalClassName"))
        return OriginalClassName;
    if (is("TabPageTab") && TabLeft >= 0)
        return TabPageTabText();
    if (is("HotSpot") && Left >= 0)
        return HotSpotText();
    return {};
}

ResultCode CXmlControl::Init(std::int32_t vlngLevel, UIObject* robjParent) {
    Level = vlngLevel;
    Parent = robjParent;
    return kSuccess;
}

void CXmlControl::SortControlsUsingTabIndex() {
    SortList(Controls);
}

void CXmlControl::SortList(List& controls) {
    std::vector<std::unique_ptr<CXmlControl>> sorted;
    sorted.reserve(controls.Count());
    for (auto& control : controls)
        sorted.push_back(std::move(control));
    std::stable_sort(sorted.begin(), sorted.end(),
                     [](const auto& left, const auto& right) { return left->TabIndex < right->TabIndex; });
    controls.Clear();
    for (auto& control : sorted) {
        control->SortControlsUsingTabIndex();
        const std::string key = control->Name;
        AddWithFreeKey(controls, std::move(control), key);
    }
}

void CXmlControl::AssignControlsBookmarkNames(List& rcolControls, UsedNames& rcolTest) {
    for (auto& control : rcolControls) {
        std::string candidate = control->Name;
        const auto [first, isFree] = rcolTest.try_emplace(text::FoldCase(candidate), 0);
        // Numbers below the last one tried stay taken, so the search goes on from there. The entry of the
        // plain name may move while candidates are added; its number is written back at the end.
        bool found = isFree;
        std::int32_t number = first->second;
        while (!found && number < kMostAttempts) {
            candidate = control->Name + std::to_string(++number);
            found = rcolTest.try_emplace(text::FoldCase(candidate), 0).second;
        }
        rcolTest[text::FoldCase(control->Name)] = number;
        control->SetHtmlBookMarkName(found ? candidate : std::string());
        AssignControlsBookmarkNames(control->Controls, rcolTest);
    }
}

void CXmlControl::Terminate() {
    for (auto& control : Controls)
        control->Terminate();
    Controls.Clear();
    Parent = nullptr;
}

} // namespace tovimar
