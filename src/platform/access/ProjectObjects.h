#pragma once

#include "platform/access/AccessSession.h"

namespace tovimar::platform::access {

/// `CurrentProject`: names and places of the project, `AllForms`, `AllReports`, `AllMacros`, `AllModules`.
HostObject MakeProjectObject(const SessionRef& session);
/// `CurrentData`: `AllTables`, `AllQueries`.
HostObject MakeDataObject(const SessionRef& session);
/// `DoCmd`: opens, closes and selects objects.
HostObject MakeCommandObject(const SessionRef& session);

} // namespace tovimar::platform::access
