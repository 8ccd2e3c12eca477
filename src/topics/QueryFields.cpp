// The fields of a query in its topic.

#include "topics/CFormHtmlTemplates.h"

#include "foundation/CXMLFile.h"
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "foundation/TextEncodings.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "project/CHelpPrjTree.h"

namespace tovimar {

namespace {

/// A line of fields is broken before each field of this number.
constexpr std::size_t kFieldsToABreak = 6;

/// The topic of a table, or of a query that is read like one; nothing where the project has no such topic.
/// Without a project the name itself serves.
std::string TopicBaseName(const std::string& source) {
    CHelpPrjTree* tree = Session::HelpProjectTree();
    if (tree == nullptr)
        return NormalizeName(source);
    std::string file = tree->GetNodeHtmlFileNameNoExt(source, "Table");
    if (file.empty())
        file = tree->GetNodeHtmlFileNameNoExt(source, "Query");
    return NormalizeName(file);
}

/// "label|field": shown as the one, linked by the other, to the anchor that the table's topic gives the
/// field.
std::string FieldText(const std::string& labelAndField, const std::string& source, const std::string& file) {
    const auto parts = text::Split(labelAndField, "|");
    if (file.empty())
        return parts.front();
    return "<A href=\"" + file + ".htm#" + NormalizeName(source) + "_" + NormalizeName(parts.back()) + "\">" +
           parts.front() + "</A>";
}

std::string FieldLine(const XmlNode& table, const std::string& source, const std::string& file) {
    std::string line;
    std::size_t number = 0;
    for (const XmlNode& field : table.childElements()) {
        if (++number > 1)
            line += ", ";
        if (number % kFieldsToABreak == 0)
            line += "<BR>";
        line += FieldText(field.attribute("Name"), source, file);
    }
    return line;
}

void AppendInheritedFields(std::string& out, const XmlNode& inherited) {
    out.append("<H2>").append(EncodeXmlText(inherited.attribute("Title"))).append("</H2>\r\n");
    for (const XmlNode& table : inherited.childElements()) {
        const std::string name = table.attribute("Name");
        const std::string file = TopicBaseName(name);
        out.append("<P>").append(FieldLine(table, name, file)).append("&nbsp;from ");
        if (file.empty())
            out.append(EncodeXmlText(name)).append("</P>\r\n");
        else
            out.append("<A href=\"" + file + ".htm\">" + EncodeXmlText(name) + "</A>&nbsp;table.</P>\r\n");
    }
}

void AppendCalculatedFields(std::string& out, const XmlNode& calculated, const std::string& queryName) {
    out.append("<H2>").append(EncodeXmlText(calculated.attribute("Title"))).append("</H2><P></P>\r\n");
    const std::string prefix = NormalizeName(queryName);
    bool first = true;
    for (const XmlNode& field : calculated.childElements()) {
        const std::string name = field.attribute("Name");
        out.append(first ? "" : "\r\n").append("<H3><A name=\"").append(prefix).append("_");
        out.append(NormalizeName(name)).append("\">").append(EncodeXmlText(name)).append("</A></H3>");
        first = false;
    }
}

} // namespace

std::string CFormHtmlTemplates::GenerateQueryFieldsHTML(const std::string& vstrQryUniqueName,
                                                        const std::string& vstr) {
    std::string out;
    Trapped("CFormHtmlTemplates", "GenerateQueryFieldsHTML", [&] {
        XmlDocument document;
        if (CXMLFile().LoadXml(vstr, document) != kSuccess)
            throw RaisedError(document.parseError().errorCode, document.parseError().reason,
                              "CFormHtmlTemplates.GenerateQueryFieldsHTML");
        const XmlNode inherited = document.selectSingleNode("//Query/InheritedFields");
        if (inherited && !inherited.childElements().empty())
            AppendInheritedFields(out, inherited);
        const XmlNode calculated = document.selectSingleNode("//Query/CalculatedFields");
        if (calculated && !calculated.childElements().empty())
            AppendCalculatedFields(out, calculated, vstrQryUniqueName);
        out = Session::Messages()->ReplaceParameters(out);
    });
    return out;
}

} // namespace tovimar
