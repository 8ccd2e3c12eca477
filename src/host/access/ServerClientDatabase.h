#pragma once

#include "platform/AutomationObject.h"

#include <string>
#include <utility>
#include <vector>

/// What a client of a database server keeps on its server. Reached over the data access library's objects,
/// which the application makes by their class names.
namespace tovimar::server_client {

/// The extended property "MS_Description"; empty without one. Raises what the library raises.
std::string TableDescription(const HostObject& app, const std::string& table);
std::string ColumnDescription(const HostObject& app, const std::string& table, const std::string& column);
std::vector<std::string> ColumnNames(const HostObject& app, const std::string& table);

} // namespace tovimar::server_client
