#include "project/ObjectContents.h"

#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/ComponentFileName.h"
#include "project/SitemapText.h"
#include "project/clsHHK.h"
#include "topics/CFormHTMLControlDef.h"
#include "uimodel/CXmlForm.h"

#include <utility>

namespace tovimar {

namespace {

std::vector<std::string> KeywordsOf(const std::string& indexes) {
    std::vector<std::string> words;
    for (auto& word : text::Split(indexes, "|"))
        if (!word.empty())
            words.push_back(std::move(word));
    return words;
}

/// Collects the links of one definition.
class Links {
public:
    explicit Links(const CXmlForm& form) : form_(form), caption_(clsHHK::TruncateCaption(form.Caption())) {}

    std::vector<IndexLink> Collect() && {
        for (const auto& word : KeywordsOf(form_.Indexes)) {
            const bool repeats = text::EqualsIgnoringCase(word, caption_);
            links_.push_back({repeats ? word : caption_, repeats ? caption_ : word, {}});
        }
        for (const auto& entry : form_.DocumentedControls) {
            if (const auto* control = form_.GetControl(entry->ControlName))
                Add(control->Name, control->Caption(), control->Indexes);
            else
                AddMenu(entry->ControlName);
        }
        for (const auto& entry : form_.DocumentedMenus)
            AddMenu(entry->ControlName);
        return std::move(links_);
    }

private:
    void AddMenu(const std::string& name) {
        if (const auto* menu = form_.GetMenu(name))
            Add(menu->Name, menu->Text, menu->Indexes);
    }

    void Add(const std::string& name, const std::string& text, const std::string& indexes) {
        if (indexes.empty())
            return;
        const auto caption =
            clsHHK::TruncateCaption(IdentifiedByName() ? name : text::ReplaceAll(text, "&", ""));
        const auto bookmark = GetComponentAnchor(form_.Name, name);
        for (const auto& word : KeywordsOf(indexes)) {
            // A keyword that only repeats the control's own caption is of use with the form's beside it.
            const bool repeats = text::EqualsIgnoringCase(word, caption);
            links_.push_back({repeats ? caption_ : caption, word, bookmark});
        }
    }

    const CXmlForm& form_;
    std::string caption_;
    std::vector<IndexLink> links_;
};

} // namespace

std::vector<IndexLink> IndexLinksOf(const CXmlForm& form) {
    return Links(form).Collect();
}

ObjectContents ContentsOf(const CXmlForm& form) {
    ObjectContents contents;
    for (const auto* entries : {&form.DocumentedMenus, &form.DocumentedControls})
        for (const auto& entry : *entries)
            contents.entries.push_back({entry->ControlName, GetComponentAnchor(form.Name, entry->ControlName),
                                        IdentifiedByName() ? entry->ControlName : entry->TopicCaption});
    contents.links = IndexLinksOf(form);
    contents.topicFile = platform::FileNameOf(form.HtmlFullPath());
    return contents;
}

} // namespace tovimar
