#pragma once

#include "platform/AutomationObject.h"

#include <string>

/// What the application's catalogues tell: names, descriptions, fields by origin, relations.
namespace tovimar::access_catalogue {

enum class Catalogue { Forms, Reports, Tables, Queries, Macros };

/// Names in order without regard to case, each encoded as a command's value, with "|" between them; system
/// objects are left out. No queries for a client of a database server.
std::string NamesList(const HostObject& app, Catalogue catalogue);

/// Empty for an object without a description, and where it can't be read.
std::string TableDescription(const HostObject& app, const std::string& name);
std::string QueryDescription(const HostObject& app, const std::string& name);
std::string MacroDescription(const HostObject& app, const std::string& name);

/// The fields of a query, split into those of tables ("Name|SourceField", by table in the order of first
/// appearance) and calculated ones. Texts in double braces are for the topic to replace.
std::string QueryXml(const HostObject& app, const std::string& queryName);

/// One heading per relation with links to the foreign table's fields; CRLF between them.
std::string RelationsHtml(const HostObject& app);

} // namespace tovimar::access_catalogue
