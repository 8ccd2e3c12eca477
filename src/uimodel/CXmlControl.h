#pragma once

#include "foundation/CXmlParseError.h"
#include "platform/KeyedList.h"
#include "platform/Value.h"
#include "platform/xml/XmlDocument.h"
#include "uimodel/UIObject.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <unordered_map>

namespace tovimar {

class CAddInProject;

/// One control of a definition and, through its own list, the tree below it: a tab control holds its
/// pages, a page or group box what stands on it, a subform the subform's controls. Coordinates are the
/// unit of the definition at hand: host units in a raw one, pixels in an adjusted one.
class CXmlControl : public UIObject {
public:
    using List = KeyedList<std::unique_ptr<CXmlControl>>;

    List Controls;              ///< key is the child's `Name`
    UIObject* Parent = nullptr; ///< not owned: a control or the form; cleared by `Terminate`
    std::int32_t Level = 0;     ///< 1 directly on the form
    std::string OriginalClassName;
    std::string Name;
    std::string Description;
    std::int32_t Width = 0;
    std::int32_t Height = 0;
    std::int32_t Top = 0;
    std::int32_t Left = 0;
    std::int32_t TabIndex = 0;
    bool Visible = true;
    std::int32_t Handle = 0;
    std::int32_t Index = -1; ///< position in a control array
    std::int32_t HelpContextId = 0;
    std::string ControlSectionName;
    /// For a label the name of the control it labels.
    std::string ParentControlName;
    std::optional<CXmlParseError> XmlParseError;
    bool HasCaption = false;
    /// The attribute `Caption` as it was read; raw definitions have it beside `Text`. Never written.
    std::string HostCaption;
    /// Rectangle of a tab page's tab; -1 in `TabLeft` means none.
    std::int32_t TabLeft = -1;
    std::int32_t TabTop = -1;
    std::int32_t TabWidth = -1;
    std::int32_t TabHeight = -1;
    std::int32_t TabPageIndex = 1; ///< -1 after reading an element without one
    std::string PicFullPath;       ///< the control's own picture, if it has one
    std::string Indexes;           ///< index keywords

    /// The XML element's name: "TextBox", "TabControl", "Page", ...
    const std::string& ElementName() const { return elementName_; }
    const std::string& ControlType() const { return controlType_; }
    /// The first non-empty type is the element's name as well.
    void SetControlType(const std::string& value);
    /// The class name read or set, else the element's name.
    const std::string& ClassName() const { return className_.empty() ? elementName_ : className_; }
    void SetClassName(const std::string& value) { className_ = value; }
    const std::string& Text() const { return text_; }
    /// A non-empty text sets `HasCaption`.
    void SetText(const std::string& value);
    /// Bookmark with blanks as "_"; an empty one is first set to `Name`.
    std::string HtmlBookMarkName();
    std::string HtmlBookMarkName() const;
    void SetHtmlBookMarkName(const std::string& value) { bookmarkName_ = value; }

    /// `Text` trimmed and without a colon behind it.
    std::string Caption() const;
    std::string Name4Xml() const;
    std::string Text4Xml() const;
    std::string Description4Xml() const;
    std::string Caption4Xml() const;
    std::string NameNormalized() const;
    std::string UniqueNameWithinXmlForm() const { return bookmarkName_.empty() ? Name : bookmarkName_; }
    bool IsTabPage() const;
    bool IsTabControl() const;
    bool IsSubFormOrSubReport() const;
    bool ParentObjectIsForm() const { return Parent != nullptr && Parent->IsForm(); }
    /// The control this one stands in; null directly on the form.
    CXmlControl* ParentControl() const;
    std::string PicLocalPath() const;
    /// `ClassName`, compared without regard to case.
    bool IsClass(const char* className) const;
    bool IsLabel() const { return IsClass("Label"); }

    bool IsForm() const override { return false; }
    std::int32_t ClientOffsetX() const override { return ClientAreaOffsetX(); }
    std::int32_t ClientOffsetY() const override { return ClientAreaOffsetY(); }
    std::int32_t ClientAreaOffsetX() const { return Parent == nullptr ? 0 : Parent->ClientOffsetX(); }
    std::int32_t ClientAreaOffsetY() const { return Parent == nullptr ? 0 : Parent->ClientOffsetY(); }
    std::int32_t ControlSectionOffsetX(const std::string& name) const override;
    std::int32_t ControlSectionOffsetY(const std::string& name) const override;

    /// The control's rectangle in the picture, pixels.
    std::int32_t HotSpotLeft(bool vfNoClientAreaOffset = false) const;
    std::int32_t HotSpotTop(bool vfNoClientAreaOffset = false) const;
    std::int32_t HotSpotRight(bool vfNoClientAreaOffset = false) const;
    std::int32_t HotSpotBottom(bool vfNoClientAreaOffset = false) const;
    /// The same of a tab page's tab.
    std::int32_t TabHotSpotLeft() const;
    std::int32_t TabHotSpotTop() const;
    std::int32_t TabHotSpotRight() const;
    std::int32_t TabHotSpotBottom() const;

    /// By name without regard to case: "Name", "BookmarkName", "Text", "Width", "Height", "Top", "Left",
    /// "TabIndex", "Visible", "Index", "HelpContextId", "ClassName", "OriginalClassName", "TabPageTab",
    /// "HotSpot"; null for any other.
    Value Properties(const std::string& name) const;

    ResultCode Init(std::int32_t vlngLevel, UIObject* robjParent);
    /// 0, the parser's error code, or the number of a reported failure (a name used twice among the
    /// children for one). Without a project pictures lie where the current project keeps them.
    ResultCode Parse(const std::string& xmlText, CAddInProject* robjAddInProject = nullptr);
    ResultCode ParseNode(const XmlNode& node, CAddInProject* robjAddInProject = nullptr);
    /// The element from its indent to its end, without a line end. Fills an empty `Indexes`.
    std::string XMLSTr();
    void AppendXml(std::string& out);
    /// Gives empty `Indexes` the default; writing does it as well.
    void FillIndexes();
    void SortControlsUsingTabIndex();
    /// Drops the tree below and the way up. A second call does nothing.
    void Terminate();

    /// Names used so far, folded, with the last number tried behind each.
    using UsedNames = std::unordered_map<std::string, std::int32_t>;
    /// Gives each control of the tree a bookmark that is unique without regard to case: the name, else the
    /// name and a number from 1 to 1000.
    static void AssignControlsBookmarkNames(List& rcolControls, UsedNames& rcolTest);
    /// The list in the order of the tab index, equal ones as they stood; sorts the children as well.
    static void SortList(List& controls);

private:
    void ReadAttributes(const XmlNode& node, CAddInProject* project);
    void ReadGeometry(const XmlAttributes& attributes);
    void AppendAttributes(std::string& out);
    void AppendChildren(std::string& out, const std::string& indent);
    std::string HotSpotText() const;
    std::string TabPageTabText() const;

    std::string elementName_;
    std::string className_;
    std::string controlType_;
    std::string bookmarkName_;
    std::string text_;
};

} // namespace tovimar
