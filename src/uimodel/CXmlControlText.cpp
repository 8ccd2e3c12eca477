// How a control is read from its element and written as one.

#include "uimodel/CXmlControl.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/TextEncodings.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "uimodel/DefinitionText.h"
#include "uimodel/ProjectPaths.h"

namespace tovimar {

using namespace definition;

namespace {

std::string FourNumbers(std::int32_t first, std::int32_t second, std::int32_t third, std::int32_t fourth) {
    return std::to_string(first) + "," + std::to_string(second) + "," + std::to_string(third) + "," +
           std::to_string(fourth);
}

} // namespace

ResultCode CXmlControl::Parse(const std::string& xmlText, CAddInProject* robjAddInProject) {
    XmlDocument document;
    if (CXMLFile().LoadXml(xmlText, document) != 0) {
        XmlParseError.emplace().SetErrInfo(document);
        return XmlParseError->errorCode;
    }
    return ParseNode(document.documentElement(), robjAddInProject);
}

ResultCode CXmlControl::ParseNode(const XmlNode& node, CAddInProject* robjAddInProject) {
    ResultCode ofChild = kSuccess;
    const ResultCode failure = Trapped("CXmlControl", "Parse", [&] {
        ReadAttributes(node, robjAddInProject);
        for (const XmlNode& element : ChildrenIn(node, "Controls")) {
            auto child = std::make_unique<CXmlControl>();
            child->Init(Level + 1, this);
            ofChild = child->ParseNode(element, robjAddInProject);
            if (ofChild != kSuccess)
                return;
            const std::string key = child->Name;
            Controls.Add(std::move(child), key);
        }
    });
    return failure != kSuccess ? failure : ofChild;
}

void CXmlControl::ReadAttributes(const XmlNode& node, CAddInProject* project) {
    elementName_ = node.baseName();
    controlType_ = elementName_;
    Name = node.attribute("Name");
    bookmarkName_ = node.attribute("BookmarkName");
    Description = node.attribute("Description");
    HostCaption = node.attribute("Caption");
    SetText(TextOr(node, "Text", "Caption"));
    className_ = node.attribute("ClassName");
    OriginalClassName = node.attribute("OriginalClassName");
    PicFullPath = ReadPicturePath(node, project);
    HelpContextId = Integer(node, "HelpContextId");
    ReadGeometry(node);
    Level = Integer(node, "Level");
    TabIndex = Integer(node, "TabIndex");
    if (Name.empty())
        Name = Value(platform::Env().clock->Timer()).AsString() + "_" + std::to_string(TabIndex);
    Visible = Boolean(node, "Visible", Visible);
    Index = Integer(node, "Index", Index);
    TabPageIndex = Integer(node, "TabPageIndex", -1);
    ControlSectionName = node.attribute("SectionName");
    ParentControlName = node.attribute("ParentControlName");
    if (!text::EqualsIgnoringCase(controlType_, "Label")) {
        Indexes = node.attribute("Indexes");
        FillIndexes();
    }
}

void CXmlControl::ReadGeometry(const XmlNode& node) {
    if (const auto size = Numbers(node, "Size", 2); !size.empty()) {
        Width = size[0];
        Height = size[1];
    }
    if (const auto location = Numbers(node, "Location", 2); !location.empty()) {
        Left = location[0];
        Top = location[1];
    }
    if (const auto tab = Numbers(node, "TabPageTab", 4); !tab.empty()) {
        TabLeft = tab[0];
        TabTop = tab[1];
        TabWidth = tab[2];
        TabHeight = tab[3];
    }
}

void CXmlControl::FillIndexes() {
    if (Indexes.empty())
        Indexes = KeywordWithoutMarks(IdentifiedByName() ? Name : Caption());
}

std::string CXmlControl::HotSpotText() const {
    return FourNumbers(HotSpotLeft(), HotSpotTop(), HotSpotRight(), HotSpotBottom());
}

std::string CXmlControl::TabPageTabText() const {
    return FourNumbers(TabLeft, TabTop, TabWidth, TabHeight);
}

std::string CXmlControl::XMLSTr() {
    std::string out;
    AppendXml(out);
    return out;
}

void CXmlControl::AppendXml(std::string& out) {
    const std::string indent = Indent(Level);
    out.append(indent).append("<").append(elementName_).append(" ");
    AppendAttributes(out);
    if (Controls.Empty())
        out.append("/>");
    else
        AppendChildren(out, indent);
}

void CXmlControl::AppendAttributes(std::string& out) {
    FillIndexes();
    Append(out, "Name = \"", Name4Xml());
    AppendUnlessEmpty(out, "Text = \"", Text4Xml());
    AppendUnlessEmpty(out, "Description = \"", Description4Xml());
    AppendPlain(out, "ClassName = \"", ClassName());
    if (!text::EqualsIgnoringCase(OriginalClassName, ClassName()))
        AppendPlain(out, "OriginalClassName = \"", OriginalClassName);
    AppendPair(out, "Location = \"", Left, Top);
    AppendPair(out, "Size = \"", Width, Height);
    if (TabIndex > -1)
        Append(out, "TabIndex = \"", TabIndex);
    if (Index > 0)
        Append(out, "Index = \"", Index);
    if (HelpContextId > 0)
        Append(out, "HelpContextId = \"", HelpContextId);
    AppendPlain(out, "PicFileName = \"", platform::FileNameOf(PicFullPath));
    if (!Visible)
        Append(out, "Visible = \"", "False");
    if (Left >= 0)
        Append(out, "HotSpot = \"", HotSpotText());
    if (TabLeft >= 0)
        Append(out, "TabPageTab = \"", TabPageTabText());
    AppendUnlessEmpty(out, "SectionName = \"", EncodeXmlName(ControlSectionName));
    AppendUnlessEmpty(out, "ParentControlName = \"", EncodeXmlName(ParentControlName));
    if (Level > 0)
        Append(out, "Level = \"", Level);
    if (TabPageIndex > -1)
        Append(out, "TabPageIndex = \"", TabPageIndex);
    if (!text::EqualsIgnoringCase(bookmarkName_, Name))
        AppendUnlessEmpty(out, "BookmarkName = \"", EncodeXmlName(bookmarkName_));
    AppendUnlessEmpty(out, "Indexes = \"", EncodeXmlText(Indexes));
}

void CXmlControl::AppendChildren(std::string& out, const std::string& indent) {
    out.append(">").append(kLineEnd).append(indent).append("<Controls>").append(kLineEnd);
    for (auto& control : Controls) {
        control->AppendXml(out);
        out.append(kLineEnd);
    }
    out.append(kLineEnd).append(indent).append("</Controls>").append(kLineEnd);
    out.append(indent).append("</").append(elementName_).append(">");
}

} // namespace tovimar
