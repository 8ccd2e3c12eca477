#include "topics/TopicSections.h"

#include "foundation/NameEncoding.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "topics/CFormHtmlTemplates.h"
#include "topics/TopicNames.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {

namespace {

constexpr std::string_view kLineEnd = "\r\n";

/// The data folder is made when it is missing: the writer is to find where descriptions belong.
std::string DescriptionsFolder() {
    const std::string folder = InstallationFolder();
    if (!platform::Env().files->FolderExists(folder))
        platform::Env().files->MakeFolders(folder);
    return folder + "descriptions\\";
}

struct ListWrappers {
    std::string_view open, close, itemOpen, itemClose;
};
constexpr ListWrappers kBulleted{"<UL>", "</UL>", "<LI>", "</LI>"};
constexpr ListWrappers kPlain{"<P>", "</P>", "", "<BR/>"};

const ListWrappers& Wrappers(bool bulleted) {
    return bulleted ? kBulleted : kPlain;
}

void AppendLine(std::string& out, std::string_view text) {
    out.append(text).append(kLineEnd);
}

void AppendLink(std::string& out, std::string_view anchor, std::string_view shown) {
    out.append("<a href=\"#").append(anchor).append("\">").append(shown).append("</a>").append(kLineEnd);
}

void AppendHeading(std::string& out, std::string_view anchor, std::string_view shown) {
    out.append("<H2><a name=\"").append(anchor).append("\">").append(shown).append("</a></H2>");
    out.append(kLineEnd);
}

} // namespace

TopicSections::TopicSections(const CXmlForm& form, TopicSwitches switches)
    : form_(form), switches_(std::move(switches)), prefix_(FormBookmarkPrefix(form)) {
    if (const CTovimarParameters* parameters = Session::Parameters()) {
        bulleted_ = parameters->BulletMenusControls;
        scaledImages_ = parameters->ImagesScale != 1;
        if (parameters->InsertExternalDescriptions)
            descriptionsFolder_ = DescriptionsFolder();
    }
}

std::string TopicSections::Anchor(const CXmlControl& control) const {
    return prefix_ + "_" + ControlBookmark(control);
}

void TopicSections::AppendMenusList(std::string& out) const {
    if (form_.Menus.Empty())
        return;
    const ListWrappers& wrappers = Wrappers(bulleted_);
    AppendLine(out, wrappers.open);
    for (const auto& menu : form_.Menus) {
        AppendLine(out, wrappers.itemOpen);
        AppendLink(out, prefix_ + "_" + MenuBookmark(*menu), MenuDisplayName(*menu));
        AppendLine(out, wrappers.itemClose);
    }
    AppendLine(out, wrappers.close);
}

void TopicSections::AppendMenus(std::string& out) const {
    CFormHtmlTemplates hooks;
    for (const auto& menu : form_.Menus) {
        AppendLine(out, hooks.BeforeMenu(form_, *menu));
        AppendHeading(out, prefix_ + "_" + MenuBookmark(*menu), MenuDisplayName(*menu));
        AppendLine(out, hooks.AfterMenu(form_, *menu));
    }
}

void TopicSections::AppendControlsList(std::string& out) const {
    if (form_.Controls.Empty())
        return;
    AppendLine(out, Wrappers(bulleted_).open);
    for (const auto& control : form_.Controls)
        if (!control->IsLabel())
            AppendListItem(out, *control, /*withChildren=*/false);
    AppendLine(out, Wrappers(bulleted_).close);
}

void TopicSections::AppendListItem(std::string& out, const CXmlControl& control, bool withChildren) const {
    AppendLine(out, Wrappers(bulleted_).itemOpen);
    AppendLink(out, Anchor(control), ControlDisplayName(control));
    AppendLine(out, Wrappers(bulleted_).itemClose);
    if (withChildren)
        for (const auto& child : control.Controls)
            AppendListItem(out, *child, withChildren);
}

void TopicSections::AppendControls(std::string& out) const {
    for (const auto& control : form_.Controls)
        if (!control->IsLabel())
            AppendSection(out, *control);
}

void TopicSections::AppendSection(std::string& out, const CXmlControl& control) const {
    CFormHtmlTemplates hooks;
    const bool tabControl = control.IsClass("TabControl");
    AppendLine(out, hooks.BeforeControl(form_, control));
    AppendHeading(out, Anchor(control),
                  tabControl ? "TAB:" + NormalizeName(control.Name) : ControlDisplayName(control));
    if (switches_.mainImage && !control.PicFullPath.empty()) {
        if (switches_.controlsMap)
            AppendMapOfControl(out, control);
        AppendControlImage(out, control);
    }
    if (tabControl)
        AppendPageLinks(out, control);
    AppendDescription(out, control);
    AppendLine(out, hooks.AfterControl(form_, control));
    for (const auto& child : control.Controls)
        if (!child->IsLabel())
            AppendSection(out, *child);
}

void TopicSections::AppendPageLinks(std::string& out, const CXmlControl& tabControl) const {
    const ListWrappers& wrappers = Wrappers(bulleted_);
    const std::string anchor = Anchor(tabControl);
    AppendLine(out, wrappers.open);
    for (const auto& page : tabControl.Controls) {
        out.append(wrappers.itemOpen).append("<a HREF=\"#").append(anchor).append("\">TAB:");
        out.append(ControlDisplayName(*page)).append("</a>").append(wrappers.itemClose).append(kLineEnd);
    }
    AppendLine(out, wrappers.close);
}

void TopicSections::AppendDescription(std::string& out, const CXmlControl& control) const {
    std::string description;
    if (!descriptionsFolder_.empty())
        description = CFormHtmlTemplates().GetDescription(Anchor(control), descriptionsFolder_);
    if (description.empty())
        description = control.Description;
    if (!description.empty())
        out.append("<p>").append(description).append("</p>").append(kLineEnd);
}

} // namespace tovimar
