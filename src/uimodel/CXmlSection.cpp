#include "uimodel/CXmlSection.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/TextEncodings.h"
#include "uimodel/DefinitionText.h"

namespace tovimar {

using namespace definition;

std::string CXmlSection::Name4Xml() const {
    return EncodeXmlName(Name);
}

std::string CXmlSection::NameNormalized() const {
    return NormalizeName(Name);
}

ResultCode CXmlSection::Init(std::int32_t /*vlngLevel*/, UIObject* robjParent) {
    Parent = robjParent;
    return kSuccess;
}

ResultCode CXmlSection::Parse(const std::string& xmlText) {
    XmlDocument document;
    if (CXMLFile().LoadXml(xmlText, document) != 0) {
        XmlParseError.emplace().SetErrInfo(document);
        return XmlParseError->errorCode;
    }
    return ParseNode(document.documentElement());
}

ResultCode CXmlSection::ParseNode(const XmlNode& node) {
    return Trapped("CXmlSection", "Parse", [&] {
        const XmlAttributes attributes(node);
        Name = attributes.attribute("Name");
        Height = Integer(attributes, "Height");
        FormRecordSelectorWidth = Integer(attributes, "FormRecordSelectorWidth");
        if (const auto offset = Numbers(attributes, "ClientAreaOffset", 2); !offset.empty()) {
            ClientAreaOffsetX = offset[0];
            ClientAreaOffsetY = offset[1];
        }
        DesignTimeHeaderHeight = Integer(attributes, "DesignTimeHeaderHeight");
    });
}

std::string CXmlSection::XMLSTr() const {
    std::string out;
    AppendXml(out);
    return out;
}

void CXmlSection::AppendXml(std::string& out) const {
    out.append("<").append(elementName_).append(" ");
    Append(out, "Name = \"", Name4Xml());
    Append(out, "Height = \"", Height);
    Append(out, "FormRecordSelectorWidth = \"", FormRecordSelectorWidth);
    AppendPair(out, "ClientAreaOffset = \"", ClientAreaOffsetX, ClientAreaOffsetY);
    Append(out, "DesignTimeHeaderHeight = \"", DesignTimeHeaderHeight);
    out.append("/>");
}

void CXmlSection::Terminate() {
    Parent = nullptr;
}

} // namespace tovimar
