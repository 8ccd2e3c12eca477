#pragma once

#include "foundation/CXmlParseError.h"
#include "platform/Error.h"
#include "platform/xml/XmlDocument.h"
#include "uimodel/UIObject.h"

#include <cstdint>
#include <optional>
#include <string>

namespace tovimar {

/// One section of a form or report: header, detail, footer. It shifts what stands in it.
/// Numbers are pixels.
class CXmlSection {
public:
    std::string Name;
    std::int32_t Height = 0;
    /// Height of the section's title bar in design view.
    std::int32_t DesignTimeHeaderHeight = 0;
    std::int32_t ClientAreaOffsetX = 0;
    std::int32_t ClientAreaOffsetY = 0;
    std::int32_t FormRecordSelectorWidth = 0;
    UIObject* Parent = nullptr; ///< not owned
    std::optional<CXmlParseError> XmlParseError;

    std::string Name4Xml() const;
    std::string NameNormalized() const;

    /// Gives 0. The level of a section is always 1.
    ResultCode Init(std::int32_t vlngLevel, UIObject* robjParent);
    /// 0, the parser's error code, or the number of a reported failure.
    ResultCode Parse(const std::string& xmlText);
    ResultCode ParseNode(const XmlNode& node);
    /// The element on one line, without a line end.
    std::string XMLSTr() const;
    void AppendXml(std::string& out) const;
    void Terminate();

private:
    std::string elementName_ = "Section";
};

} // namespace tovimar
