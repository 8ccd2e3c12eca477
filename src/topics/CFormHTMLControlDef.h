#pragma once

#include "foundation/CXmlParseError.h"
#include "platform/Error.h"
#include "platform/xml/XmlDocument.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

/// One control or menu entry that a saved topic documents.
class CFormHTMLControlDef {
public:
    std::string FormName;
    std::string ControlName;
    std::string BookmarkName; ///< the anchor's name behind the form's name
    std::string TopicCaption; ///< the section's heading
    bool IsMenu = false;
    std::optional<CXmlParseError> XmlParseError;

    /// All four texts are there.
    bool IsValid() const;
    /// Control, bookmark and caption are the same, compared exactly.
    bool EqualTo(const CFormHTMLControlDef& robj) const;

    /// Reads a section between comment markers, from byte `vlngPosS` to before `vlngPosE`.
    ResultCode ParseHTML(std::string_view vstrBuf, std::size_t vlngPosS = 0,
                         std::size_t vlngPosE = std::string_view::npos);
    /// Reads an anchor, from "<a name=" through "</a>". 0x80040001 when its name has no form's name before
    /// it.
    ResultCode ParseHTML1(std::string_view vstrBuf, const std::string& vstrFormName);
    /// Reads a heading with its tags. The same code as ParseHTML1.
    ResultCode ParseHTML2(std::string_view vstrBuf, const std::string& vstrFormName);
    /// Reads an `Item`; `FormName` isn't part of it.
    ResultCode ParseXML(const std::string& xmlText);
    ResultCode ParseNode(const XmlNode& node);
    /// The `Item` on one line, without a line end.
    std::string XMLSTr() const;
    void AppendXml(std::string& out) const;

private:
    void ReadMarkedAnchor(const std::vector<std::string>& parts);
    ResultCode SplitAnchorName(const std::string& fullName, const std::string& formName);
};

} // namespace tovimar
