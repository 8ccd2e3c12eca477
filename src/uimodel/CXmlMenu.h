#pragma once

#include "foundation/CXmlParseError.h"
#include "platform/Error.h"
#include "platform/Value.h"
#include "platform/xml/XmlDocument.h"
#include "uimodel/UIObject.h"

#include <cstdint>
#include <optional>
#include <string>

namespace tovimar {

/// One entry of an object's menu. The definition knows a flat list of entries.
class CXmlMenu {
public:
    std::string Name;
    std::string Text;
    /// Lives in memory only.
    std::int32_t HelpContextId = 0;
    /// Index keywords; filled in on reading and on writing where they are empty.
    std::string Indexes;
    UIObject* Parent = nullptr; ///< not owned
    std::optional<CXmlParseError> XmlParseError;

    std::string Name4Xml() const;
    std::string NameNormalized() const;
    std::string Text4Xml() const;
    bool IsForm() const { return false; }
    /// "Name", "Text" or "Caption" (the last two are one field), compared exactly; else null.
    Value Properties(const std::string& name) const;

    ResultCode Init(std::int32_t vlngLevel, UIObject* robjParent);
    /// 0, the parser's error code, or the number of a reported failure.
    ResultCode Parse(const std::string& xmlText);
    ResultCode ParseNode(const XmlNode& node);
    /// The element on one line, without a line end.
    std::string XMLSTr();
    void AppendXml(std::string& out);
    void Terminate();
};

} // namespace tovimar
