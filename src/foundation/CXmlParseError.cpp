#include "foundation/CXmlParseError.h"

#include "platform/xml/XmlDocument.h"

namespace tovimar {

void CXmlParseError::SetErrInfo(const XmlDocument& document) {
    const XmlParseReport& report = document.parseError();
    errorCode = report.errorCode;
    reason = report.reason;
    filepos = std::to_string(report.filepos);
    line = std::to_string(report.line);
    linepos = std::to_string(report.linepos);
    srcText = report.srcText;
    URL = report.url;
}

} // namespace tovimar
