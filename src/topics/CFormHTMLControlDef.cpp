#include "topics/CFormHTMLControlDef.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/TextEncodings.h"
#include "platform/text/Text.h"
#include "topics/TopicText.h"
#include "uimodel/DefinitionText.h"

namespace tovimar {

namespace {

/// Takes blanks, the quotes around a value and the slash of an element's end off.
std::string Unquoted(std::string_view value) {
    std::string name = text::Trim(value);
    if (!name.empty() && IsQuote(name.front()))
        name.erase(0, 1);
    if (!name.empty() && name.back() == '/')
        name.pop_back();
    name = text::Trim(name);
    if (!name.empty() && IsQuote(name.back()))
        name.pop_back();
    return name;
}

struct Anchor {
    std::string name;
    std::string_view rest; ///< behind the ">" of the element
};

/// From the first "=" to the next ">"; an empty rest and name when there is none.
Anchor AnchorIn(std::string_view section) {
    const std::size_t equals = section.find('=');
    const std::size_t end = equals == std::string_view::npos ? equals : section.find('>', equals);
    if (end == std::string_view::npos)
        return {};
    return {Unquoted(section.substr(equals + 1, end - equals - 1)), section.substr(end + 1)};
}

/// The last run of plain text in front of the anchor's end; "???" when there is none, an image for one.
std::string CaptionOf(std::string_view content) {
    std::string caption = "???";
    for (const std::string& part : text::Split(content, ">"))
        if (!part.empty() && part.front() != '<')
            caption = part.substr(0, part.find('<'));
    return caption;
}

} // namespace

bool CFormHTMLControlDef::IsValid() const {
    return !FormName.empty() && !ControlName.empty() && !BookmarkName.empty() && !TopicCaption.empty();
}

bool CFormHTMLControlDef::EqualTo(const CFormHTMLControlDef& robj) const {
    return ControlName == robj.ControlName && BookmarkName == robj.BookmarkName &&
           TopicCaption == robj.TopicCaption;
}

ResultCode CFormHTMLControlDef::ParseHTML(std::string_view vstrBuf, std::size_t vlngPosS,
                                          std::size_t vlngPosE) {
    if (vlngPosS >= vstrBuf.size() || vlngPosE <= vlngPosS)
        return kSuccess;
    const std::string section = text::Trim(WithoutLineEnds(vstrBuf.substr(vlngPosS, vlngPosE - vlngPosS)));
    const auto brackets = text::Split(section, "[");
    if (brackets.size() < 3 || brackets[1].size() < 2)
        return kSuccess;
    FormName = brackets[1].substr(0, brackets[1].size() - 2);
    ControlName = brackets[2].substr(0, brackets[2].find(']'));
    ReadMarkedAnchor(text::Split(section, " "));
    TopicCaption = DecodeEntities(std::string(Between(section, "<h2>", "</h2>")));
    return kSuccess;
}

void CFormHTMLControlDef::ReadMarkedAnchor(const std::vector<std::string>& parts) {
    for (std::size_t i = 0; i + 1 < parts.size(); ++i) {
        if (parts[i] != "--><a" && parts[i] != "<a")
            continue;
        const std::string& part = parts[i + 1];
        const std::size_t found = part.find(FormName);
        if (found == std::string::npos)
            return;
        const std::string name = text::Mid(part.substr(found + FormName.size()), 2);
        BookmarkName = name.substr(0, name.find('>'));
        if (!BookmarkName.empty() && IsQuote(BookmarkName.back()))
            BookmarkName.pop_back();
        return;
    }
}

ResultCode CFormHTMLControlDef::SplitAnchorName(const std::string& fullName, const std::string& formName) {
    const std::size_t split = formName.empty() ? fullName.find('_') : formName.size();
    if (split >= fullName.size() || fullName.compare(0, formName.size(), formName) != 0)
        return kFailure1;
    FormName = fullName.substr(0, split);
    ControlName = text::Mid(std::string_view(fullName).substr(split), 2);
    BookmarkName = ControlName;
    return kSuccess;
}

ResultCode CFormHTMLControlDef::ParseHTML1(std::string_view vstrBuf, const std::string& vstrFormName) {
    const Anchor anchor = AnchorIn(vstrBuf);
    const ResultCode code = SplitAnchorName(anchor.name, vstrFormName);
    if (code == kSuccess)
        TopicCaption = DecodeEntities(std::string(Between(vstrBuf, "<h2>", "</h2>")));
    return code;
}

ResultCode CFormHTMLControlDef::ParseHTML2(std::string_view vstrBuf, const std::string& vstrFormName) {
    const std::string heading = text::Trim(WithoutLineEnds(vstrBuf));
    if (heading.find("Menus:") != std::string::npos || heading.find("Controls:") != std::string::npos)
        return kSuccess;
    Anchor anchor = AnchorIn(heading);
    // Further attributes stand behind a blank.
    if (const std::size_t blank = anchor.name.find(' '); blank != std::string::npos) {
        anchor.name.erase(blank);
        if (!anchor.name.empty() && IsQuote(anchor.name.back()))
            anchor.name.pop_back();
    }
    if (anchor.name.empty())
        return kSuccess;
    if (const ResultCode code = SplitAnchorName(anchor.name, vstrFormName); code != kSuccess)
        return code;
    const std::size_t end = FindAscii(anchor.rest, "</a>");
    if (end != std::string_view::npos && end != 0)
        TopicCaption = DecodeEntities(CaptionOf(anchor.rest.substr(0, end)));
    return kSuccess;
}

ResultCode CFormHTMLControlDef::ParseXML(const std::string& xmlText) {
    ResultCode result = kSuccess;
    const ResultCode failure = Trapped("CFormHTMLControlDef", "ParseXML", [&] {
        XmlDocument document;
        if (CXMLFile().LoadXml(xmlText, document) == kSuccess) {
            result = ParseNode(document.documentElement());
            return;
        }
        XmlParseError.emplace().SetErrInfo(document);
        result = XmlParseError->errorCode;
    });
    return failure != kSuccess ? failure : result;
}

ResultCode CFormHTMLControlDef::ParseNode(const XmlNode& node) {
    ControlName = node.attribute("Name");
    BookmarkName = node.attribute("Bmk");
    TopicCaption = node.attribute("Caption");
    IsMenu = text::EqualsIgnoringCase(node.attribute("IsMenu"), "True");
    return kSuccess;
}

std::string CFormHTMLControlDef::XMLSTr() const {
    std::string out;
    AppendXml(out);
    return out;
}

void CFormHTMLControlDef::AppendXml(std::string& out) const {
    out.append("<Item  ");
    definition::Append(out, "Name=\"", definition::Escaped(ControlName));
    definition::Append(out, "Bmk=\"", definition::Escaped(BookmarkName));
    definition::Append(out, "Caption=\"", EncodeXmlText(TopicCaption));
    out.append(IsMenu ? "IsMenu = \"True\" " : "").append(" />");
}

} // namespace tovimar
