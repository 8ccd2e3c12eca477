#pragma once

/// Ctrl+C. The handler only sets a flag; a run looks at it at its next check.
namespace tovimar::platform {

/// Catches SIGINT and SIGTERM from now on. A second signal before the first was looked at ends the program.
void InstallInterruptHandler();
bool InterruptRequested();
void ClearInterrupt();
/// As if the user had pressed Ctrl+C.
void RequestInterrupt();

} // namespace tovimar::platform
