#pragma once

#include "platform/access/DatabaseReader.h"

#include <string>

/// How a database's content passes from the reading process to this one. The bytes come from a process that
/// may have been led astray by its file: reading them raises 0x80040001 for anything that isn't of the shape.
namespace tovimar::platform::access {

std::string ContentToJson(const DatabaseContent& content);
DatabaseContent ContentFromJson(const std::string& bytes);
std::string RecordsToJson(const Records& records);
Records RecordsFromJson(const std::string& bytes);

} // namespace tovimar::platform::access
