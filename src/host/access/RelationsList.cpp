#include "host/access/AccessCatalogue.h"

#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "host/access/LateBound.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"

#include <vector>

namespace tovimar::access_catalogue {
namespace {

constexpr const char* kTable = "Table";
constexpr std::int32_t kOneToOne = 1;

std::string AsHtml(const std::string& name) {
    return text::ReplaceAll(text::ReplaceAll(name, "&", "&amp;"), "<", "&lt;");
}

/// Base name of the table's topic; empty when it has none.
std::string TopicOf(const std::string& table) {
    const CHelpPrjTree* tree = Session::HelpProjectTree();
    return tree == nullptr ? std::string() : tree->GetNodeHtmlFileNameNoExt(table, kTable);
}

std::string TableReference(const std::string& table) {
    const CHelpPrjTree* tree = Session::HelpProjectTree();
    const std::string reference = tree == nullptr ? std::string() : tree->GetNodeHtmlRef(table, kTable);
    return reference.empty() ? AsHtml(table) : reference;
}

std::string FieldLinks(const HostObject& relation, const std::string& foreignTable) {
    const std::string topic = NormalizeName(TopicOf(foreignTable));
    std::vector<std::string> links;
    late::ForEach(late::Object(relation, "Fields"), [&](const HostObject& field) {
        const std::string name = late::Text(field, "ForeignName");
        if (topic.empty())
            links.push_back(AsHtml(name));
        else
            links.push_back("<A href=\"" + topic + ".htm#" + NormalizeName(foreignTable) + "_" +
                            NormalizeName(name) + "\">" + AsHtml(name) + "</A>");
    });
    return text::Join(links, ", ");
}

} // namespace

std::string RelationsHtml(const HostObject& app) {
    std::vector<std::string> lines;
    late::ForEach(late::Object(late::Object(app, "CurrentDb"), "Relations"), [&](const HostObject& relation) {
        const bool oneToOne = (late::Integer(relation, "Attributes") & kOneToOne) != 0;
        const std::string foreignTable = late::Text(relation, "ForeignTable");
        lines.push_back("<H2>" + TableReference(late::Text(relation, "Table")) + " -> " +
                        TableReference(foreignTable) + " (" + (oneToOne ? "1:1" : "1:N") + ", " +
                        FieldLinks(relation, foreignTable) + ")</H2>");
    });
    return text::Join(lines, "\r\n");
}

} // namespace tovimar::access_catalogue
