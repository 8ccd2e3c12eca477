#pragma once

#include <string>
#include <string_view>

namespace tovimar {

class CFormHTMLControlDef;
class CXmlControl;
class CXmlForm;
class CXmlMenu;

/// Renders the topic of a definition and its pieces. Keeps no state. Line ends are CRLF; the comment
/// markers and anchors are format: a saved topic is read back by them.
class CFormHtmlTemplates {
public:
    /// The whole topic, in a template file or, with an empty path, in the built-in layout. Project tags and
    /// the style sheet's and charset's are left for the caller. A missing template gives an empty page.
    std::string FileTemplate(CXmlForm& robjXmlForm, bool vfMainImage, bool vfControlsMap, bool vfMenusList,
                             bool vfMenus, bool vfControlsList, bool vfControls,
                             const std::string& vstrTemplateFile, const std::string& vstrZoom,
                             bool vfUseLocalImagePath, const std::string& vstrPicsDir,
                             const std::string& vstrQryXml);

    std::string FormTitle(const CXmlForm& robjXmlForm);
    std::string ControlsMap(const CXmlForm& robjXmlForm);
    std::string ControlsMapOfControl(const CXmlForm& robjXmlForm, const CXmlControl& robjXmlCtl,
                                     bool vfShowMainImage = true);
    /// One `AREA`. With a parent the coordinates are those of the parent's picture.
    std::string ControlArea(const std::string& vstrFrmName, const CXmlForm& rfrm, const CXmlControl& rctl,
                            const CXmlControl* rctlParent, bool IsTabArea);
    /// Empty when the picture isn't on the disk.
    std::string MainImage(const CXmlForm& robjXmlForm, bool vfUseLocalImagePath,
                          const std::string& vstrPicsDir);
    std::string ControlImage(const CXmlForm& robjXmlForm, const CXmlControl& robjXmlControl,
                             bool vfUseLocalImagePath, const std::string& vstrPicsDir);
    std::string MenusList(const CXmlForm& robjXmlForm);
    std::string Menus(const CXmlForm& robjXmlForm);
    std::string ControlsList(const CXmlForm& robjXmlForm);
    std::string SubControlsList(const CXmlForm& robjXmlForm, const CXmlControl& robjXmlCtl,
                                bool vfListSubControls);
    std::string Controls(const CXmlForm& robjXmlForm, bool vfShowMainImage, bool vfShowControlsMap,
                         bool vfUseLocalImagePath, const std::string& vstrPicsDir);
    std::string SubControls(const CXmlForm& robjXmlForm, const CXmlControl& robjXmlCtl, bool vfShowMainImage,
                            bool vfShowControlsMap, bool vfUseLocalImagePath, const std::string& vstrPicsDir);

    /// Anchors of sections: the form's prefix, "_", the control's or entry's.
    std::string BookmarkName(const CXmlForm& rxmlForm, const CXmlControl& rxmlControl);
    std::string BookmarkNameForMenu(const CXmlForm& rxmlForm, const CXmlMenu& rxmlMenu);
    std::string BookmarkNameForDocumentedMenuOrControl(const CXmlForm& rxmlForm,
                                                       const CFormHTMLControlDef& robj);

    /// The meta element of a charset; empty for none.
    std::string Charset(const std::string& vstrCharset);
    /// Description of a bookmark in "Descriptions.mdb" of a folder; empty when there is none.
    std::string GetDescription(const std::string& vstrKey, const std::string& vstrMdbFolder);
    /// The fields of a query, inherited ones as links to their tables' topics.
    std::string GenerateQueryFieldsHTML(const std::string& vstrQryUniqueName, const std::string& vstr);

    // Text around a section, empty lines as it stands.
    std::string BeforeMenu(const CXmlForm&, const CXmlMenu&) { return {}; }
    std::string AfterMenu(const CXmlForm&, const CXmlMenu&) { return {}; }
    std::string BeforeControl(const CXmlForm&, const CXmlControl&) { return {}; }
    std::string AfterControl(const CXmlForm&, const CXmlControl&) { return {}; }
};

/// The style block that zooms a page on the screen, with its line ends.
std::string ZoomBlock(std::string_view zoom);
/// The script that loads the web help's frame page around a topic opened by itself; no line end behind it.
std::string WebHelpScript(std::string_view framePage = "main.htm");

} // namespace tovimar
