#pragma once

#include <cstdint>
#include <functional>
#include <string>

/// What every step of a run shows and traces: the host's meter and pointer, the system's own progress window
/// and the time stamps of the trace log.
namespace tovimar {

namespace platform {
struct DateTime;
}
class CTovimarServerAgent;
class CTovimarServerData;

/// The sender of commands and the run's shared data. Both raise 91 without a connection.
CTovimarServerAgent& HostAgent();
CTovimarServerData& RunData();

/// The host's meter, from its making to its end.
class HostMeter {
public:
    HostMeter(const std::string& message, std::int32_t maximum);
    ~HostMeter();
    HostMeter(const HostMeter&) = delete;
    HostMeter& operator=(const HostMeter&) = delete;
    void Update(std::int32_t value);
};

/// The host's busy pointer, from its making to its end.
class Hourglass {
public:
    Hourglass();
    ~Hourglass();
    Hourglass(const Hourglass&) = delete;
    Hourglass& operator=(const Hourglass&) = delete;
};

/// The system's own progress window, from its making to its end.
class ProgressWindow {
public:
    ProgressWindow(const std::string& message, std::int32_t maximum);
    ~ProgressWindow();
    ProgressWindow(const ProgressWindow&) = delete;
    ProgressWindow& operator=(const ProgressWindow&) = delete;
    void Update(const std::string& message, std::int32_t value);
};

/// Traces a text that is only composed while the trace is on.
void TraceText(const std::function<std::string()>& text);
/// "<now>: Timestamp - " and the text.
void TraceTimestamp(const char* text);
/// Date and time in the clock's long form: "November 22, 2026 23:29:32".
std::string LongDateAndTime(const platform::DateTime& time);
/// Of now.
std::string LongDateAndTime();

} // namespace tovimar
