// How a definition is read from its element and written as text.

#include "uimodel/CXmlForm.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/TextEncodings.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "uimodel/DefinitionText.h"
#include "uimodel/FreeKey.h"
#include "uimodel/ProjectPaths.h"

#include <array>

namespace tovimar {

using namespace definition;

namespace {

struct Kind {
    const char* element;
    std::int32_t objectType;
};

/// In the order in which a document is searched for its object.
constexpr std::array<Kind, 7> kKinds{
    {{"Form", 2}, {"Report", 3}, {"Table", 0}, {"Query", 1}, {"Macro", 4}, {"Worksheet", 81}, {"Chart", 82}}};

const Kind* KindOf(const std::string& element) {
    for (const Kind& kind : kKinds)
        if (element == kind.element)
            return &kind;
    return nullptr;
}

XmlNode FindObject(const XmlDocument& document) {
    const XmlNode root = document.documentElement();
    if (KindOf(root.nodeName()) != nullptr)
        return root;
    for (const Kind& kind : kKinds)
        if (XmlNode found = document.selectSingleNode(std::string("//") + kind.element))
            return found;
    return {};
}

XmlNode ChildNamed(const XmlNode& node, std::string_view name) {
    for (const XmlNode& child : node.childElements())
        if (child.nodeName() == name)
            return child;
    return {};
}

/// Reads an element into a list. A failed child ends the reading; its parser's report moves to the form's.
template <typename T>
ResultCode ReadInto(KeyedList<std::unique_ptr<T>>& list, std::unique_ptr<T> child, ResultCode parsed,
                    std::optional<CXmlParseError>& report) {
    if (parsed != kSuccess) {
        if (child->XmlParseError.has_value())
            report = child->XmlParseError;
        return parsed;
    }
    const std::string key = child->Name;
    AddWithFreeKey(list, std::move(child), key);
    return kSuccess;
}

/// One list of the definition: its tag, each item on a line, the closing tag; nothing for an empty list.
template <typename T> void AppendList(std::string& out, std::string_view tag, T& list) {
    if (list.Empty())
        return;
    out.append("<").append(tag).append(">").append(kLineEnd);
    for (auto& item : list) {
        item->AppendXml(out);
        out.append(kLineEnd);
    }
    out.append("</").append(tag).append(">").append(kLineEnd);
}

constexpr const char* kMyXamlOpening =
    "<?xml version=\"1.0\" encoding=\"utf-8\" standalone=\"no\"?>\r\n"
    "<MyXaml xml:lang=\"ru-RU\" xmlns:def=\"Definition\" "
    "xmlns=\"System.Windows.Forms, System.Windows.Forms, Version=1.0.5000.0, Culture=neutral, "
    "PublicKeyToken=b77a5c561934e089\" "
    "xmlns:css=\"CSSample, DataSet1.cs, Version=0.0.0.0, Culture=neutral, PublicKeyToken=null\" "
    "xmlns:s=\"System, mscorlib, Version=1.0.5000.0, Culture=neutral, PublicKeyToken=b77a5c561934e089\" "
    "xmlns:sd=\"System.Data, System.Data, Version=1.0.5000.0, Culture=neutral, "
    "PublicKeyToken=b77a5c561934e089\">\r\n";

} // namespace

ResultCode CXmlForm::TakeReport(const XmlDocument& document) {
    XmlParseError.emplace().SetErrInfo(document);
    return XmlParseError->errorCode;
}

ResultCode CXmlForm::Load(const std::string& xmlFileFullPath, CAddInProject* robjAddInProject) {
    ResultCode result = kSuccess;
    const ResultCode failure = Trapped("CXmlForm", "Load", [&] {
        XmlDocument document;
        if (CXMLFile().Load(xmlFileFullPath, document) != kSuccess) {
            result = TakeReport(document);
            return;
        }
        const XmlNode root = FindObject(document);
        if (!root)
            throw RaisedError(kFailure1, "Error parsing XML definition of '" + xmlFileFullPath + "'",
                              "CXmlForm.Load");
        result = ParseNode(root, robjAddInProject);
    });
    return failure != kSuccess ? failure : result;
}

ResultCode CXmlForm::LoadXml(const std::string& xmlText) {
    ResultCode result = kSuccess;
    const ResultCode failure = Trapped("CXmlForm", "LoadXml", [&] {
        XmlDocument document;
        if (CXMLFile().LoadXml(xmlText, document) != kSuccess) {
            result = TakeReport(document);
            return;
        }
        const XmlNode root = FindObject(document);
        result = root ? ParseNode(root) : kFailure1;
    });
    return failure != kSuccess ? failure : result;
}

ResultCode CXmlForm::Parse(const std::string& xmlText, CAddInProject* robjAddInProject) {
    XmlDocument document;
    if (!document.loadXML(xmlText))
        return TakeReport(document);
    return ParseNode(FindObject(document), robjAddInProject);
}

ResultCode CXmlForm::ParseNode(const XmlNode& root, CAddInProject* robjAddInProject) {
    ResultCode ofChild = kSuccess;
    const ResultCode failure = Trapped("CXmlForm", "Parse", [&] {
        const Kind* kind = root ? KindOf(root.nodeName()) : nullptr;
        if (kind == nullptr)
            throw RaisedError(kFailure2, "Undefined source object tag", "CXmlForm.Parse");
        ClassName = kind->element;
        SourceObjectType = kind->objectType;
        ControlsChanged();
        ReadRoot(XmlAttributes(root), robjAddInProject);
        ofChild = ReadChildren(root, robjAddInProject);
    });
    return failure != kSuccess ? failure : ofChild;
}

void CXmlForm::ReadRoot(const XmlAttributes& root, CAddInProject* project) {
    Name = root.attribute("Name");
    Text = TextOr(root, "Text", "Caption");
    picFullPath_ = ReadPicturePath(root, project);
    htmlFullPath_ = ReadTopicPath(root, project);
    HelpContextId = Integer(root, "HelpContextId");
    NewHelpContextIdsCount = Integer(root, "NewHelpContextIdsCount");
    hWnd = Integer(root, "HWND");
    ReadSizes(root);
    OriginalClassName = root.attribute("OriginalClassName");
    HasMap = Boolean(root, "HasMap", false);
    Charset = root.attribute("Charset");
    Description = root.attribute("Description");
    Language = root.attribute("Language");
    stylesheetFullPath_ = root.attribute("Stylesheet");
    SourceProjectType = root.attribute("SourceProjectType");
    SourceProjectName = root.attribute("SourceProjectName");
    if (NamePrefix.empty())
        NamePrefix = root.attribute("NamePrefix");
    BorderStyle = Integer(root, "BorderStyle", -1);
    GUIObjectSubType = root.attribute("GUIObjectSubType");
    Indexes = root.attribute("Indexes");
    FillIndexes();
}

void CXmlForm::ReadSizes(const XmlAttributes& root) {
    if (const auto size = Numbers(root, "WindowSize", 2); !size.empty()) {
        Width = size[0];
        Height = size[1];
    }
    if (const auto base = Numbers(root, "AutoScaleBaseSize", 2); !base.empty()) {
        AutoScaleBaseSizeX = base[0];
        AutoScaleBaseSizeY = base[1];
    }
    if (const auto offset = Numbers(root, "ClientAreaOffset", 2); !offset.empty()) {
        ClientAreaOffsetX = offset[0];
        ClientAreaOffsetY = offset[1];
    }
}

ResultCode CXmlForm::ReadChildren(const XmlNode& root, CAddInProject* project) {
    const auto readAll = [&](const char* listName, auto& list, auto parse) -> ResultCode {
        using Child = typename std::remove_reference_t<decltype(list.At(1))>::element_type;
        for (const XmlNode& element : ChildrenIn(root, listName)) {
            auto child = std::make_unique<Child>();
            child->Init(1, this);
            const ResultCode parsed = parse(*child, element);
            if (const ResultCode code = ReadInto(list, std::move(child), parsed, XmlParseError);
                code != kSuccess)
                return code;
        }
        return kSuccess;
    };
    const auto parse = [](auto& child, const XmlNode& element) { return child.ParseNode(element); };
    if (const ResultCode code = readAll("Sections", Sections, parse); code != kSuccess)
        return code;
    if (const ResultCode code = readAll("Menu", Menus, parse); code != kSuccess)
        return code;
    const auto parseControl = [&](CXmlControl& child, const XmlNode& element) {
        return child.ParseNode(element, project);
    };
    if (const ResultCode code = readAll("Controls", Controls, parseControl); code != kSuccess)
        return code;
    CXmlControl::UsedNames used;
    CXmlControl::AssignControlsBookmarkNames(Controls, used);
    return ReadDocumented(root);
}

ResultCode CXmlForm::ReadDocumented(const XmlNode& root) {
    DocumentedMenus.Clear();
    DocumentedControls.Clear();
    const XmlNode documented = ChildNamed(root, "Documented");
    if (!documented)
        return kSuccess;
    if (const ResultCode code = ReadItems(documented, "Menus", DocumentedMenus); code != kSuccess)
        return code;
    return ReadItems(documented, "Controls", DocumentedControls);
}

ResultCode CXmlForm::ReadItems(const XmlNode& documented, const char* listName, DefList& list) {
    const bool controls = &list == &DocumentedControls;
    for (const XmlNode& element : ChildrenIn(documented, listName)) {
        auto def = std::make_unique<CFormHTMLControlDef>();
        const ResultCode parsed = def->ParseNode(element);
        if (parsed != kSuccess) {
            if (def->XmlParseError.has_value())
                XmlParseError = def->XmlParseError;
            return parsed;
        }
        def->FormName = Name;
        const std::string key = def->BookmarkName;
        if (!controls) {
            AddWithFreeKey(list, std::move(def), key);
            continue;
        }
        if (!def->IsMenu && GetMenu(key) != nullptr)
            def->IsMenu = true;
        if (!list.Contains(key))
            list.Add(std::move(def), key);
    }
    return kSuccess;
}

void CXmlForm::FillIndexes() {
    if (Indexes.empty())
        Indexes = ShortenedKeyword(IdentifiedByName() ? Name : Caption());
}

std::string CXmlForm::XMLSTr() {
    FillIndexes();
    std::string out;
    out.append("<").append(ClassName).append(" ");
    AppendAttributes(out);
    AppendOrigin(out);
    out.append(">").append(kLineEnd);
    AppendList(out, "Sections", Sections);
    AppendList(out, "Menu", Menus);
    AppendList(out, "Controls", Controls);
    AppendDocumented(out);
    out.append("</").append(ClassName).append(">").append(kLineEnd);
    return text::ReplaceAll(out, "\r\n\r\n", kLineEnd);
}

void CXmlForm::AppendAttributes(std::string& out) const {
    Append(out, "Name = \"", Name4Xml());
    Append(out, "Text = \"", Text4Xml());
    if (AutoScaleBaseSizeX > 0)
        AppendPair(out, "AutoScaleBaseSize = \"", AutoScaleBaseSizeX, AutoScaleBaseSizeY);
    AppendPair(out, "WindowSize = \"", Width, Height);
    AppendPair(out, "ClientAreaOffset = \"", ClientAreaOffsetX, ClientAreaOffsetY);
    Append(out, "BorderStyle = \"", BorderStyle);
    if (HasMap)
        out.append("HasMap = \"True\" ");
    AppendPlain(out, "Charset=\"", Charset);
    AppendUnlessEmpty(out, "Description=\"", EncodeXmlText(Description));
    AppendPlain(out, "Language=\"", Language);
    AppendPlain(out, "Stylesheet=\"", platform::FileNameOf(stylesheetFullPath_));
    AppendPlain(out, "NamePrefix=\"", NamePrefix);
    AppendPlain(out, "PicFileName=\"", platform::FileNameOf(picFullPath_));
    AppendPlain(out, "HtmlFileName=\"", platform::FileNameOf(htmlFullPath_));
}

void CXmlForm::AppendOrigin(std::string& out) const {
    if (HelpContextId > 0 || HelpContextId == -1)
        Append(out, "HelpContextId = \"", HelpContextId);
    if (NewHelpContextIdsCount > 0)
        Append(out, "NewHelpContextIdsCount = \"", NewHelpContextIdsCount);
    AppendPlain(out, "SourceProjectType = \"", SourceProjectType);
    AppendPlain(out, "SourceProjectName = \"", SourceProjectName);
    AppendUnlessEmpty(out, "OriginalClassName = \"", EncodeXmlName(OriginalClassName));
    AppendPlain(out, "GUIObjectSubType = \"", GUIObjectSubType);
    if (hWnd != 0)
        Append(out, "HWND = \"", hWnd);
    AppendUnlessEmpty(out, "Indexes = \"", EncodeXmlText(Indexes));
}

void CXmlForm::AppendDocumented(std::string& out) const {
    out.append("<Documented>").append(kLineEnd);
    AppendList(out, "Menus", DocumentedMenus);
    AppendList(out, "Controls", DocumentedControls);
    out.append("</Documented>").append(kLineEnd);
}

std::string CXmlForm::SaveXml(const std::string& vstrFolder, const std::string& vstrXmlFileFullPath) {
    std::string written;
    Trapped("CXmlForm", "SaveXml", [&] {
        const std::string path = vstrXmlFileFullPath.empty()
                                     ? platform::WithTrailingBackslash(vstrFolder) + XmlFileName()
                                     : vstrXmlFileFullPath;
        if (CXMLFile().SaveXml(path, XMLSTr()) == kSuccess)
            written = path;
    });
    return written;
}

std::string CXmlForm::MyXaml() {
    return kMyXamlOpening + XMLSTr() + "\r\n</MyXaml>";
}

} // namespace tovimar
