#include "uimodel/CXmlMenu.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/TextEncodings.h"
#include "uimodel/DefinitionText.h"

namespace tovimar {

using namespace definition;

namespace {

void FillIndexes(CXmlMenu& menu) {
    if (menu.Indexes.empty())
        menu.Indexes = KeywordWithoutMarks(IdentifiedByName() ? menu.Name : menu.Text);
}

} // namespace

std::string CXmlMenu::Name4Xml() const {
    return EncodeXmlName(Name);
}

std::string CXmlMenu::NameNormalized() const {
    return NormalizeName(Name);
}

std::string CXmlMenu::Text4Xml() const {
    return EncodeXmlText(Text);
}

Value CXmlMenu::Properties(const std::string& name) const {
    if (name == "Name")
        return Name;
    if (name == "Text" || name == "Caption")
        return Text;
    return {};
}

ResultCode CXmlMenu::Init(std::int32_t /*vlngLevel*/, UIObject* robjParent) {
    Parent = robjParent;
    return kSuccess;
}

ResultCode CXmlMenu::Parse(const std::string& xmlText) {
    XmlDocument document;
    if (CXMLFile().LoadXml(xmlText, document) != 0) {
        XmlParseError.emplace().SetErrInfo(document);
        return XmlParseError->errorCode;
    }
    return ParseNode(document.documentElement());
}

ResultCode CXmlMenu::ParseNode(const XmlNode& node) {
    return Trapped("CXmlMenu", "Parse", [&] {
        const XmlAttributes attributes(node);
        Name = attributes.attribute("Name");
        Text = TextOr(attributes, "Text", "Caption");
        Indexes = attributes.attribute("Indexes");
        FillIndexes(*this);
    });
}

std::string CXmlMenu::XMLSTr() {
    std::string out;
    AppendXml(out);
    return out;
}

void CXmlMenu::AppendXml(std::string& out) {
    FillIndexes(*this);
    out.append("<MenuEntry ");
    Append(out, "Name = \"", Name4Xml());
    Append(out, "Caption = \"", Text4Xml());
    AppendUnlessEmpty(out, "Indexes = \"", EncodeXmlText(Indexes));
    out.append("/>");
}

void CXmlMenu::Terminate() {
    Parent = nullptr;
}

} // namespace tovimar
