#pragma once

#include "platform/Error.h"

#include <functional>
#include <string>

namespace tovimar {

/// What every trap calls: adds hints and the description of the system to the detail, counts the failure
/// in the run state, traces it, shows it and offers to report it. Never fails.
void ReportError(const RaisedError& error, const std::string& className, const std::string& operationName,
                 const std::string& detail = {});

/// Composes, traces and shows a failure. With `reportFlag` the user is asked whether to send it to the
/// support address. `line` 0 and `number` 0 together show the description alone.
void rErrorMessage(ResultCode number, int line, const std::string& description, const std::string& detail,
                   const std::string& className, const std::string& operationName, bool reportFlag);

/// Blocks "[Current MS Access Status Info]", "[System Information]" and "[Locale information]".
std::string SystemDescription();

/// Runs `operation` under the error trap of a public operation. 0 on success; a failure is reported under
/// the two names and its number returned. A stopped run is no failure of the program: it sets
/// `generationInterrupted` and gives kGeneralFailure unreported.
ResultCode Trapped(const char* className, const char* operationName, const std::function<void()>& operation);
/// The same; `detail` is only asked when the operation fails.
ResultCode Trapped(const char* className, const char* operationName, const std::function<void()>& operation,
                   const std::function<std::string()>& detail);
/// Lets Ctrl+C be seen; true when the run was stopped.
bool StopRequested();
/// For loops over objects: lets Ctrl+C be seen, and ends the operation in which it stands when the run was
/// stopped. The trap around it tells nobody of it.
void LeaveIfInterrupted();
/// Runs `step` and drops its failure, for steps whose failing must not stop what follows.
void PassOver(const std::function<void()>& step);

} // namespace tovimar
