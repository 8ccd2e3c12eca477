#include "topics/CFormHtmlTemplates.h"

#include "platform/Environment.h"
#include "platform/access/DescriptionsReader.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "topics/CFormHTMLControlDef.h"
#include "topics/TopicNames.h"
#include "topics/TopicSections.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {

namespace {

/// Runs one writer of sections into a text of its own.
template <typename Append> std::string Written(Append append) {
    std::string out;
    append(out);
    return out;
}

TopicSections ForPictures(const CXmlForm& form, bool localImagePath, const std::string& picsFolder) {
    return TopicSections(form, {true, true, localImagePath, picsFolder});
}

} // namespace

std::string CFormHtmlTemplates::FormTitle(const CXmlForm& robjXmlForm) {
    return "<!-- + FORM TITLE + -->\r\n<H1>" + FormDisplayName(robjXmlForm) +
           "</H1>\r\n<!-- - FORM TITLE - -->\r\n";
}

std::string CFormHtmlTemplates::ControlsMap(const CXmlForm& robjXmlForm) {
    return Written([&](std::string& out) { TopicSections(robjXmlForm).AppendMap(out); });
}

std::string CFormHtmlTemplates::ControlsMapOfControl(const CXmlForm& robjXmlForm,
                                                     const CXmlControl& robjXmlCtl,
                                                     bool /*vfShowMainImage*/) {
    return Written([&](std::string& out) { TopicSections(robjXmlForm).AppendMapOfControl(out, robjXmlCtl); });
}

std::string CFormHtmlTemplates::ControlArea(const std::string& vstrFrmName, const CXmlForm& rfrm,
                                            const CXmlControl& rctl, const CXmlControl* rctlParent,
                                            bool IsTabArea) {
    return Written([&](std::string& out) {
        TopicSections(rfrm).AppendArea(out, vstrFrmName, rctl, rctlParent, IsTabArea);
    });
}

std::string CFormHtmlTemplates::MainImage(const CXmlForm& robjXmlForm, bool vfUseLocalImagePath,
                                          const std::string& vstrPicsDir) {
    return Written([&](std::string& out) {
        ForPictures(robjXmlForm, vfUseLocalImagePath, vstrPicsDir).AppendMainImage(out);
    });
}

std::string CFormHtmlTemplates::ControlImage(const CXmlForm& robjXmlForm, const CXmlControl& robjXmlControl,
                                             bool vfUseLocalImagePath, const std::string& vstrPicsDir) {
    return Written([&](std::string& out) {
        ForPictures(robjXmlForm, vfUseLocalImagePath, vstrPicsDir).AppendControlImage(out, robjXmlControl);
    });
}

std::string CFormHtmlTemplates::MenusList(const CXmlForm& robjXmlForm) {
    return Written([&](std::string& out) { TopicSections(robjXmlForm).AppendMenusList(out); });
}

std::string CFormHtmlTemplates::Menus(const CXmlForm& robjXmlForm) {
    return Written([&](std::string& out) { TopicSections(robjXmlForm).AppendMenus(out); });
}

std::string CFormHtmlTemplates::ControlsList(const CXmlForm& robjXmlForm) {
    return Written([&](std::string& out) { TopicSections(robjXmlForm).AppendControlsList(out); });
}

std::string CFormHtmlTemplates::SubControlsList(const CXmlForm& robjXmlForm, const CXmlControl& robjXmlCtl,
                                                bool vfListSubControls) {
    return Written([&](std::string& out) {
        TopicSections(robjXmlForm).AppendListItem(out, robjXmlCtl, vfListSubControls);
    });
}

std::string CFormHtmlTemplates::Controls(const CXmlForm& robjXmlForm, bool vfShowMainImage,
                                         bool vfShowControlsMap, bool vfUseLocalImagePath,
                                         const std::string& vstrPicsDir) {
    return Written([&](std::string& out) {
        TopicSections(robjXmlForm, {vfShowMainImage, vfShowControlsMap, vfUseLocalImagePath, vstrPicsDir})
            .AppendControls(out);
    });
}

std::string CFormHtmlTemplates::SubControls(const CXmlForm& robjXmlForm, const CXmlControl& robjXmlCtl,
                                            bool vfShowMainImage, bool vfShowControlsMap,
                                            bool vfUseLocalImagePath, const std::string& vstrPicsDir) {
    return Written([&](std::string& out) {
        TopicSections(robjXmlForm, {vfShowMainImage, vfShowControlsMap, vfUseLocalImagePath, vstrPicsDir})
            .AppendSection(out, robjXmlCtl);
    });
}

std::string CFormHtmlTemplates::BookmarkName(const CXmlForm& rxmlForm, const CXmlControl& rxmlControl) {
    return FormBookmarkPrefix(rxmlForm) + "_" + ControlBookmark(rxmlControl);
}

std::string CFormHtmlTemplates::BookmarkNameForMenu(const CXmlForm& rxmlForm, const CXmlMenu& rxmlMenu) {
    return FormBookmarkPrefix(rxmlForm) + "_" + MenuBookmark(rxmlMenu);
}

std::string CFormHtmlTemplates::BookmarkNameForDocumentedMenuOrControl(const CXmlForm& rxmlForm,
                                                                       const CFormHTMLControlDef& robj) {
    return FormBookmarkPrefix(rxmlForm) + "_" + robj.BookmarkName;
}

std::string CFormHtmlTemplates::Charset(const std::string& vstrCharset) {
    if (vstrCharset.empty())
        return {};
    return "<meta http-equiv=\"Content-Type\" content=\"text/html; charset=" + vstrCharset + "\">\r\n";
}

std::string CFormHtmlTemplates::GetDescription(const std::string& vstrKey, const std::string& vstrMdbFolder) {
    const std::string path = platform::WithTrailingBackslash(vstrMdbFolder) + "Descriptions.mdb";
    platform::FileSystem& files = *platform::Env().files;
    if (!files.FileExists(path))
        return {};
    const auto& descriptions = platform::access::ReadDescriptions(files.ToNative(path));
    const auto found = descriptions.find(text::FoldCase(vstrKey));
    return found == descriptions.end() ? std::string() : found->second;
}

} // namespace tovimar
