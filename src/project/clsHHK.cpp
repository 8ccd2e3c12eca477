#include "project/clsHHK.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/ComponentFileName.h"
#include "project/SitemapText.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {

namespace {

constexpr std::size_t kLongestCaption = 32;

std::vector<std::string> KeywordsOf(const std::string& indexes) {
    std::vector<std::string> words;
    for (auto& word : text::Split(indexes, "|"))
        if (!word.empty())
            words.push_back(std::move(word));
    return words;
}

} // namespace

/// What the index takes of a control or menu.
struct clsHHK::Source {
    std::string name;
    std::string caption;
    std::string indexes;
};

clsHHK::clsHHK() {
    Reset();
}

clsHHK::~clsHHK() = default;

void clsHHK::Terminate() {
    root_->Terminate();
}

void clsHHK::Reset() {
    root_ = std::make_unique<clsHHKObject>();
    root_->ObjectType = "ROOT";
    root_->IsRoot = true;
}

void clsHHK::AddCustomLink(const std::string& vstrIndexCaption, const std::string& vstrIndexKey,
                           const std::string& vstrGeneratedFileName, const std::string& vstrBookmarkName) {
    Trapped("clsHHK", "AddLink_NEW", [&] {
        auto local = platform::FileNameOf(vstrGeneratedFileName);
        if (!vstrBookmarkName.empty())
            local += '#' + vstrBookmarkName;
        auto* group = root_->GetObject(vstrIndexKey);
        const bool groupExisted = group != nullptr;
        if (!groupExisted) {
            auto made = std::make_unique<clsHHKObject>();
            made->Key = vstrIndexKey;
            made->Parameters = {{"name", vstrIndexKey}, {"Local", local}};
            group = made.get();
            root_->Add(std::move(made));
        }
        auto link = std::make_unique<clsHHKObject>();
        link->Key = vstrIndexKey;
        link->Parameters = {{"Name", vstrIndexCaption}, {"Local", local}};
        if (groupExisted) {
            link->SetIndexGroupDisplayValue(vstrIndexCaption);
            link->Key = link->Parameters[1].Value();
        }
        group->Add(std::move(link));
    });
}

void clsHHK::AddXmlFormLinks(const CXmlForm& rxmlForm, const std::string& /*vstrGeneratedHtmlFile*/) {
    const auto formCaption = TruncateCaption(rxmlForm.Caption());
    const auto file = platform::FileNameOf(rxmlForm.HtmlFullPath());
    for (const auto& word : KeywordsOf(rxmlForm.Indexes)) {
        if (text::EqualsIgnoringCase(word, formCaption))
            AddCustomLink(word, formCaption, file, {});
        else
            AddCustomLink(formCaption, word, file, {});
    }
    for (const auto& entry : rxmlForm.DocumentedControls) {
        if (const auto* control = rxmlForm.GetControl(entry->ControlName))
            AddControlLinks(rxmlForm, {control->Name, control->Caption(), control->Indexes}, formCaption,
                            file);
        else if (const auto* menu = rxmlForm.GetMenu(entry->ControlName))
            AddControlLinks(rxmlForm, {menu->Name, menu->Text, menu->Indexes}, formCaption, file);
    }
    for (const auto& entry : rxmlForm.DocumentedMenus)
        if (const auto* menu = rxmlForm.GetMenu(entry->ControlName))
            AddControlLinks(rxmlForm, {menu->Name, menu->Text, menu->Indexes}, formCaption, file);
}

void clsHHK::AddControlLinks(const CXmlForm& form, const Source& source, const std::string& formCaption,
                             const std::string& file) {
    const auto caption =
        TruncateCaption(IdentifiedByName() ? source.name : text::ReplaceAll(source.caption, "&", ""));
    const auto bookmark = GetComponentAnchor(form.Name, source.name);
    for (const auto& word : KeywordsOf(source.indexes)) {
        // A keyword that only repeats the control's own caption is of use with the form's beside it.
        const bool repeats = text::EqualsIgnoringCase(word, caption);
        AddCustomLink(repeats ? formCaption : caption, word, file, bookmark);
    }
}

std::string clsHHK::TruncateCaption(const std::string& text) {
    const auto words = text::Split(text, " ");
    if (words.size() < 2)
        return text;
    std::string joined;
    for (const auto& word : words) {
        if (word.empty())
            continue;
        if (!joined.empty())
            joined += ' ';
        joined += word;
        if (text::Length(joined) > kLongestCaption)
            return text::Left(joined, kLongestCaption) + "...";
    }
    return joined;
}

std::string clsHHK::HHKContents() const {
    std::string out = "<!DOCTYPE HTML PUBLIC \"-//IETF//DTD HTML//EN\">\r\n"
                      "<HTML>\r\n"
                      "<HEAD>\r\n"
                      "<!-- Sitemap 1.0 -->\r\n"
                      "<!-- Put Java help object tag here -->\r\n"
                      "</HEAD>\r\n"
                      "<BODY>\r\n"
                      "<UL>\r\n";
    const auto* parameters = Session::Parameters();
    if (parameters != nullptr && parameters->FillIndexFromAppObjectsAndControls)
        out += root_->GenerateHHK(0);
    return out + "</UL>\r\n</BODY>\r\n</HTML>\r\n";
}

} // namespace tovimar
