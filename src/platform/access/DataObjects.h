#pragma once

#include "platform/access/AccessSession.h"

namespace tovimar::platform::access {

/// `CurrentDb`: table and query definitions, relations, the macros' documents. Lists start at 0.
HostObject MakeDatabaseObject(const SessionRef& session);

/// `Properties("MDE")`: "T" for a compiled database, an error 3270 for any other.
HostObject MakeDatabaseProperties(const SessionRef& session);

} // namespace tovimar::platform::access
