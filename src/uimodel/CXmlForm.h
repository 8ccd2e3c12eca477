#pragma once

#include "foundation/CXmlParseError.h"
#include "platform/KeyedList.h"
#include "platform/Value.h"
#include "platform/xml/XmlDocument.h"
#include "topics/CFormHTMLControlDef.h"
#include "uimodel/CXmlControl.h"
#include "uimodel/CXmlMenu.h"
#include "uimodel/CXmlSection.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

namespace tovimar {

class CAddInProject;
class CFormHTMLControlDefs;

/// The definition of one documented object: a form, report, table, query, macro, worksheet or chart,
/// independent of the host. The same content lies on disk as UTF-8 XML in the project's xml folder.
/// `Terminate` ends it; the destructor does the same.
class CXmlForm : public UIObject {
public:
    using DefList = KeyedList<std::unique_ptr<CFormHTMLControlDef>>;

    CXmlForm() = default;
    CXmlForm(const CXmlForm&) = delete;
    CXmlForm& operator=(const CXmlForm&) = delete;
    ~CXmlForm() override;

    CXmlControl::List Controls;                       ///< key `Name`, "_" behind a taken one
    KeyedList<std::unique_ptr<CXmlMenu>> Menus;       ///< key `Name`
    KeyedList<std::unique_ptr<CXmlSection>> Sections; ///< key `Name`
    /// What the saved topic documents; key `BookmarkName`, none after `MakeDefs`.
    DefList DocumentedMenus;
    DefList DocumentedControls;
    std::optional<CXmlParseError> XmlParseError; ///< of the last failed load
    std::string Name;
    std::string ClassName = "Form"; ///< the element's name, which tells the kind
    std::string OriginalClassName;
    std::string Text; ///< the caption
    std::int32_t Width = 0;
    std::int32_t Height = 0;
    std::int32_t ClientAreaOffsetX = 0;
    std::int32_t ClientAreaOffsetY = 0;
    std::int32_t AutoScaleBaseSizeX = 0;
    std::int32_t AutoScaleBaseSizeY = 0;
    std::int32_t HelpContextId = 0; ///< 0 none; -1 is a value of its own
    std::string SourceProjectType;  ///< "MS ACCESS", "VB6", ...
    std::string SourceProjectName;
    bool HasMap = false; ///< the topic's picture has an image map
    std::string Charset;
    std::string Language;
    std::string NamePrefix; ///< prefix of bookmark names
    std::string Description;
    /// 0 table, 1 query, 2 form, 3 report, 4 macro, 81 worksheet, 82 chart.
    std::int32_t SourceObjectType = 0;
    std::int32_t BorderStyle = 2;
    std::int32_t NewHelpContextIdsCount = 0;
    std::string GUIObjectSubType;
    std::int32_t hWnd = 0;
    std::string Indexes; ///< index keywords; filled in by reading and writing where empty

    const std::string& Type_() const { return ClassName; }
    const std::string& Caption() const { return Text; }
    void SetCaption(const std::string& value) { Text = value; }

    /// A stored bare file name is completed by the current project's folder, if there is one.
    std::string PicFullPath() const;
    void SetPicFullPath(const std::string& value) { picFullPath_ = value; }
    std::string HtmlFullPath() const;
    void SetHtmlFullPath(const std::string& value) { htmlFullPath_ = value; }
    /// Empty stays empty.
    std::string StylesheetFullPath() const;
    void SetStylesheetFullPath(const std::string& value) { stylesheetFullPath_ = value; }

    std::string Name4Xml() const;
    std::string Text4Xml() const;
    std::string Caption4Xml() const { return Text4Xml(); }
    std::string NameNormalized() const;
    /// Base name of the topic's file, which tells apart objects of one name.
    std::string UniqueName() const;
    std::string XmlFileName() const;
    std::string PicLocalPath() const;
    bool HasMenu() const { return !Menus.Empty(); }
    bool IsForm() const override { return true; }
    std::int32_t ClientOffsetX() const override { return ClientAreaOffsetX; }
    std::int32_t ClientOffsetY() const override { return ClientAreaOffsetY; }
    std::int32_t ControlSectionOffsetX(const std::string& sectionName = {}) const override;
    std::int32_t ControlSectionOffsetY(const std::string& sectionName = {}) const override;
    std::int32_t ControlSectionHeaderHeight(const std::string& sectionName = {}) const;
    /// "Name", "Caption" and "HelpContextId", compared exactly; null for any other.
    Value Properties(const std::string& name) const;

    /// 0; the parser's error code with its report in `XmlParseError`; or the number of a reported failure.
    /// The project says where topic and picture lie; without it the current project does.
    ResultCode Load(const std::string& xmlFileFullPath, CAddInProject* robjAddInProject = nullptr);
    /// As `Load` for text; 0x80040001 when no object's element is found.
    ResultCode LoadXml(const std::string& xmlText);
    ResultCode Parse(const std::string& xmlText, CAddInProject* robjAddInProject = nullptr);
    /// Reads an object's element.
    ResultCode ParseNode(const XmlNode& root, CAddInProject* robjAddInProject = nullptr);

    /// The definition as text, without a declaration. Fills empty `Indexes`, also of its controls.
    std::string XMLSTr();
    /// The path written, empty on a failure. An empty path takes the folder and `XmlFileName`.
    std::string SaveXml(const std::string& vstrFolder, const std::string& vstrXmlFileFullPath = {});
    std::string MyXaml();

    /// Every control below `rctl` (the whole form without it), each before its children, added to the list.
    std::vector<CXmlControl*> AllControls(std::vector<CXmlControl*> rcol = {},
                                          CXmlControl* rctl = nullptr) const;
    /// The first control in that order, or menu entry, whose normalized name this is; null for none.
    /// The first look-up builds an index; whoever changes the controls afterwards calls `ControlsChanged`.
    CXmlControl* GetControl(const std::string& vstrName, CXmlControl* rctl = nullptr) const;
    CXmlMenu* GetMenu(const std::string& vstrName) const;
    void ControlsChanged();

    void SortControlsUsingTabIndex();

    /// Rebuilds the documented lists from a saved topic. With the flag, lists that say the same stay and
    /// the result is 1; else 0 or an error number.
    ResultCode MakeDefs(const std::string& vstrHtmlFileFullPath, bool vfDoNotReplaceDefsIfTheSame);
    /// The same from the topic's text at hand.
    ResultCode MakeDefsFromText(const std::string& html, bool vfDoNotReplaceDefsIfTheSame);

    /// Renders the topic of a form or report, writes it unless the path is empty, gives 0 or the number of
    /// a reported failure, and reads the documented lists back.
    /// While set, the SaveHTML operations put the topic's text here and leave the writing to the caller, who
    /// has more to fill in.
    std::string* HeldTopic = nullptr;
    ResultCode SaveHTMLEx(const std::string& htmlFileFullPath, bool HtmlOfReport,
                          bool vfApplyZoomFactor = false, bool vfUseLocalImagePath = true,
                          const std::string& vstrPicsDir = {});
    /// The same of a table, query or macro; the template is `vstrHtmlFileName`.
    ResultCode SaveHTML4Table(const std::string& htmlFileFullPath, const std::string& vstrHtmlFileName,
                              bool HtmlOfReport, bool vfApplyZoomFactor = false,
                              bool vfUseLocalImagePath = true, const std::string& vstrPicsDir = {},
                              const std::string& vstrQryXml = {});
    /// The same of a worksheet or chart, with its contents.
    ResultCode SaveHTML4Worksheet(const std::string& htmlFileFullPath, const std::string& vstrHtmlFileName,
                                  bool HtmlOfReport, bool vfApplyZoomFactor = false,
                                  bool vfUseLocalImagePath = true, const std::string& vstrPicsDir = {},
                                  const std::string& vstrQryXml = {}, const std::string& vstrWksHtml = {});

    void Terminate();

    /// Zoom of topics rendered with a zoom factor, process-wide.
    static std::string ZoomFactor;

private:
    struct Rendering;
    ResultCode Render(const char* operation, const Rendering& rendering);
    std::string RenderText(const Rendering& rendering);
    ResultCode TakeReport(const XmlDocument& document);
    void ReadRoot(const XmlAttributes& root, CAddInProject* project);
    void ReadSizes(const XmlAttributes& root);
    ResultCode ReadChildren(const XmlNode& root, CAddInProject* project);
    ResultCode ReadDocumented(const XmlNode& root);
    ResultCode ReadItems(const XmlNode& documented, const char* listName, DefList& list);
    ResultCode TakeDefs(CFormHTMLControlDefs& defs, bool keepTheSame);
    void FillIndexes();
    void AppendAttributes(std::string& out) const;
    void AppendOrigin(std::string& out) const;
    void AppendDocumented(std::string& out) const;
    const CXmlSection* Section(const std::string& name) const;
    void EnsureIndex() const;

    std::string picFullPath_;
    std::string htmlFullPath_;
    std::string stylesheetFullPath_;
    bool terminated_ = false;

    mutable std::unordered_map<std::string, CXmlControl*> controlsByName_;
    mutable std::unordered_map<std::string, CXmlMenu*> menusByName_;
    mutable bool indexed_ = false;
};

} // namespace tovimar
