#pragma once

#include <cstdint>

namespace tovimar {

/// State by which a run is judged. Process-wide; reached through `Session::Run()`.
struct RunState {
    /// The run is to stop at its next check: Cancel, Ctrl+C or the error limit set it.
    bool generationInterrupted = false;
    bool generationInProgress = false;
    /// Failures reported since the run began; negative when the user chose to go on over them.
    std::int32_t runErrorCount = 0;
    /// Warnings shown, for the closing summary of a program.
    std::int32_t warningCount = 0;
};

/// A run with this many reported failures stops.
constexpr std::int32_t kErrorLimit = 50;

/// Sets `generationInterrupted` and clears the count once the limit is reached.
void CheckErrorLimit();

} // namespace tovimar
