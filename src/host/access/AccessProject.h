#pragma once

#include "platform/AutomationObject.h"

#include <string>

/// What kind of database the application has open.
namespace tovimar::access_project {

/// Empty when nothing is open; never fails.
std::string FullName(const HostObject& app);
/// Compiled: objects can't be opened in design view. False when the host doesn't tell.
bool IsMDEorADE(const HostObject& app);
/// A client of a database server. False when the host doesn't tell.
bool IsADPorADE(const HostObject& app);

} // namespace tovimar::access_project
