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
    const XmlAttributes attributes(node);
    Name = attributes.attribute("Name");
    bookmarkName_ = attributes.attribute("BookmarkName");
    Description = attributes.attribute("Description");
    HostCaption = attributes.attribute("Caption");
    SetText(TextOr(attributes, "Text", "Caption"));
    className_ = attributes.attribute("ClassName");
    OriginalClassName = attributes.attribute("OriginalClassName");
    PicFullPath = ReadPicturePath(attributes, project);
    HelpContextId = Integer(attributes, "HelpContextId");
    ReadGeometry(attributes);
    Level = Integer(attributes, "Level");
    TabIndex = Integer(attributes, "TabIndex");
    if (Name.empty())
        Name = Value(platform::Env().clock->Timer()).AsString() + "_" + std::to_string(TabIndex);
    Visible = Boolean(attributes, "Visible", Visible);
    Index = Integer(attributes, "Index", Index);
    TabPageIndex = Integer(attributes, "TabPageIndex", -1);
    ControlSectionName = attributes.attribute("SectionName");
    ParentControlName = attributes.attribute("ParentControlName");
    if (!text::EqualsIgnoringCase(controlType_, "Label")) {
        Indexes = attributes.attribute("Indexes");
        FillIndexes();
    }
}

void CXmlControl::ReadGeometry(const XmlAttributes& attributes) {
    if (const auto size = Numbers(attributes, "Size", 2); !size.empty()) {
        Width = size[0];
        Height = size[1];
    }
    if (const auto location = Numbers(attributes, "Location", 2); !location.empty()) {
        Left = location[0];
        Top = location[1];
    }
    if (const auto tab = Numbers(attributes, "TabPageTab", 4); !tab.empty()) {
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
