#include "foundation/CXMLFile.h"

#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

namespace tovimar {
namespace {

/// The text behind its XML header and what separates them, beginning with "<".
std::string WithoutHeader(const std::string& xml) {
    if (xml.find("<?xml version=\"1.0\"") == std::string::npos)
        return xml;
    const auto end = xml.find("?>");
    if (end == std::string::npos)
        throw RaisedError(kFailure1, "Invalid xml file header", "CXmlFile.LoadXml");
    // The header's own line end goes with it; texts written without one lose nothing.
    std::string rest = text::TrimWhitespace(std::string_view(xml).substr(end + 2));
    if (!rest.empty() && rest.front() != '<')
        rest.insert(0, "<");
    return rest;
}

} // namespace

ResultCode CXMLFile::Load(const std::string& vstrXmlFileFullPath, XmlDocument& robjXmlDoc) {
    robjXmlDoc.load(vstrXmlFileFullPath);
    XmlParseError.SetErrInfo(robjXmlDoc);
    return XmlParseError.errorCode;
}

ResultCode CXMLFile::LoadXml(const std::string& vstrXmlStr, XmlDocument& robjXmlDoc, bool vfUseUnicode) {
    const std::string header =
        vfUseUnicode ? "<?xml version=\"1.0\" encoding=\"utf-16\" ?>" : std::string(kXmlHeader);
    robjXmlDoc.loadXML(header + "\r\n" + WithoutHeader(vstrXmlStr));
    XmlParseError.SetErrInfo(robjXmlDoc);
    return XmlParseError.errorCode;
}

ResultCode CXMLFile::SaveXml(const std::string& vstrXmlFileFullPath, const std::string& vstrXmlStr,
                             Durability durability) {
    const bool hasHeader = vstrXmlStr.find(kXmlHeader) != std::string::npos;
    return CUTF8FileWriter().SaveFile(vstrXmlFileFullPath,
                                      hasHeader ? vstrXmlStr : std::string(kXmlHeader) + "\r\n" + vstrXmlStr,
                                      /*vfAddUTF8FileHeader=*/false,
                                      /*vfSaveAsUsualTextFileIfNotUTF8=*/false, durability);
}

} // namespace tovimar
