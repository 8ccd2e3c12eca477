#pragma once

#include "platform/Error.h"

#include <string>

namespace tovimar {

class XmlDocument;

/// What the XML parser reported, as text; all fields but the code are for a person. Lines and positions
/// count from 1.
class CXmlParseError {
public:
    /// Copies the report of the document's last load.
    void SetErrInfo(const XmlDocument& document);

    ResultCode errorCode = 0;
    std::string reason;
    std::string filepos;
    std::string line;
    std::string linepos;
    std::string srcText;
    std::string URL;
};

} // namespace tovimar
