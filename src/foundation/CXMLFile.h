#pragma once

#include "foundation/CUTF8FileWriter.h"
#include "foundation/CXmlParseError.h"

#include <string>

namespace tovimar {

class XmlDocument;

/// First line of every XML file that the system writes; CRLF follows it.
constexpr const char* kXmlHeader = "<?xml version=\"1.0\" encoding=\"utf-8\" ?>";

/// The one gate to XML texts and files.
class CXMLFile {
public:
    /// Parses a file. 0, or the parser's code with `XmlParseError` filled.
    ResultCode Load(const std::string& vstrXmlFileFullPath, XmlDocument& robjXmlDoc);
    /// Parses a text with or without an XML header; a header is replaced by a fresh one, which names utf-16
    /// with `vfUseUnicode` (the text is UTF-8 either way). Returns as Load. Raises 0x80040001
    /// "Invalid xml file header" for a header without its end.
    ResultCode LoadXml(const std::string& vstrXmlStr, XmlDocument& robjXmlDoc, bool vfUseUnicode = false);
    /// Writes a text as UTF-8, with the header in front when the text has none. 0, or the failure's number.
    ResultCode SaveXml(const std::string& vstrXmlFileFullPath, const std::string& vstrXmlStr,
                       Durability durability = Durability::Ordinary);

    /// Report of the last load; its code is 0 when that succeeded.
    CXmlParseError XmlParseError;
};

} // namespace tovimar
