#include "host/access/AccessCatalogue.h"

#include "foundation/ErrorTrap.h"
#include "host/access/AccessProject.h"
#include "host/access/LateBound.h"
#include "host/access/ServerClientDatabase.h"
#include "host/server/CXmlCommand.h"
#include "platform/KeyedList.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <vector>

namespace tovimar::access_catalogue {
namespace {

constexpr std::string_view kSystemPrefix = "MSys";

HostObject CatalogueObject(const HostObject& app, Catalogue catalogue) {
    const auto of = [&app](const char* owner, const char* member) {
        return late::Object(late::Object(app, owner), member);
    };
    switch (catalogue) {
    case Catalogue::Forms:
        return of("CurrentProject", "AllForms");
    case Catalogue::Reports:
        return of("CurrentProject", "AllReports");
    case Catalogue::Tables:
        return of("CurrentData", "AllTables");
    case Catalogue::Queries:
        return of("CurrentData", "AllQueries");
    case Catalogue::Macros:
        break;
    }
    return of("CurrentProject", "AllMacros");
}

/// The "Description" property of a definition of the open database, reached by `definition`.
template <typename Definition> std::string DescriptionOf(const HostObject& app, Definition definition) {
    std::string description;
    PassOver([&] {
        description =
            late::PropertyOrNull(definition(late::Object(app, "CurrentDb")), "Description").AsString();
    });
    return description;
}

/// Names go in as they stand unless the text could not be read back then.
std::string Readable(const std::string& text) {
    std::string readable = text;
    if (readable.find_first_of("&<\"") != std::string::npos) {
        readable = text::ReplaceAll(readable, "&", "&amp;");
        readable = text::ReplaceAll(readable, "<", "&lt;");
        readable = text::ReplaceAll(readable, "\"", "&quot;");
    }
    readable.erase(std::remove_if(readable.begin(), readable.end(),
                                  [](char c) {
                                      return static_cast<unsigned char>(c) < 32 && c != '\t' && c != '\r' &&
                                             c != '\n';
                                  }),
                   readable.end());
    return readable;
}

struct QueryFields {
    /// By table: the entries "Name|SourceField".
    KeyedList<std::vector<std::string>> inherited;
    std::vector<std::string> calculated;
};

QueryFields SplitFields(const HostObject& app, const std::string& queryName) {
    QueryFields split;
    const HostObject query = late::Object(late::Object(app, "CurrentDb"), "QueryDefs", {queryName});
    late::ForEach(late::Object(query, "Fields"), [&split](const HostObject& field) {
        const std::string name = late::Text(field, "Name");
        const std::string sourceField = late::TextOrEmpty(field, "SourceField");
        if (sourceField.empty()) {
            split.calculated.push_back(name);
            return;
        }
        const std::string table = late::TextOrEmpty(field, "SourceTable");
        if (split.inherited.Find(table) == nullptr)
            split.inherited.Add({}, table);
        if (auto* fields = split.inherited.Find(table))
            fields->push_back(name + "|" + sourceField);
    });
    return split;
}

void AppendField(std::string& xml, const std::string& name) {
    xml.append("<Field Name=\"").append(Readable(name)).append("\"/>\r\n");
}

} // namespace

std::string NamesList(const HostObject& app, Catalogue catalogue) {
    if (catalogue == Catalogue::Queries && access_project::IsADPorADE(app))
        return {};
    if (catalogue == Catalogue::Reports)
        PassOver([&app] { late::Call(app, "RefreshDatabaseWindow"); });
    const bool filtered = catalogue != Catalogue::Forms && catalogue != Catalogue::Reports;
    std::vector<std::string> names;
    late::ForEach(CatalogueObject(app, catalogue), [&](const HostObject& entry) {
        std::string name = late::Text(entry, "Name");
        if (!filtered || !text::StartsWithIgnoringCase(name, kSystemPrefix))
            names.push_back(std::move(name));
    });
    std::stable_sort(names.begin(), names.end(), [](const std::string& left, const std::string& right) {
        return text::CompareIgnoringCase(left, right) < 0;
    });
    for (std::string& name : names)
        name = CXmlCommand::EncodeValue(name);
    return text::Join(names, "|");
}

std::string TableDescription(const HostObject& app, const std::string& name) {
    if (!access_project::IsADPorADE(app))
        return DescriptionOf(
            app, [&name](const HostObject& database) { return late::Object(database, "TableDefs", {name}); });
    std::string description;
    PassOver([&] { description = server_client::TableDescription(app, name); });
    return description;
}

std::string QueryDescription(const HostObject& app, const std::string& name) {
    if (access_project::IsADPorADE(app))
        return {};
    return DescriptionOf(
        app, [&name](const HostObject& database) { return late::Object(database, "QueryDefs", {name}); });
}

std::string MacroDescription(const HostObject& app, const std::string& name) {
    if (access_project::IsADPorADE(app))
        return {};
    return DescriptionOf(app, [&name](const HostObject& database) {
        return late::Object(late::Object(database, "Containers", {Value("Scripts")}), "Documents", {name});
    });
}

std::string QueryXml(const HostObject& app, const std::string& queryName) {
    const QueryFields fields = SplitFields(app, queryName);
    std::string xml = "<?xml version=\"1.0\" encoding=\"utf-8\"?>\r\n";
    xml.append("<Query Name=\"").append(Readable(queryName)).append("\" Type=\"Query\" Description=\"");
    xml.append(Readable(QueryDescription(app, queryName))).append("\">\r\n");
    xml += "<InheritedFields Title=\"{{FieldsFromTables}}\">\r\n";
    for (const auto& [table, entries] : fields.inherited.Entries()) {
        xml.append("<Table Name=\"").append(Readable(table)).append("\">\r\n");
        for (const std::string& entry : entries)
            AppendField(xml, entry);
        xml += "</Table>\r\n";
    }
    xml += "</InheritedFields>\r\n<CalculatedFields Title=\"{{CalculatedFields}}\">\r\n";
    for (const std::string& name : fields.calculated)
        AppendField(xml, name);
    return xml += "</CalculatedFields>\r\n</Query>\r\n";
}

} // namespace tovimar::access_catalogue
