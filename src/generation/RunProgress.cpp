#include "generation/RunProgress.h"

#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"

#include <array>
#include <cstdio>

namespace tovimar {
namespace {

constexpr ResultCode kNoObject = 91;

} // namespace

CTovimarServerAgent& HostAgent() {
    if (auto* agent = Session::ServerAgent())
        return *agent;
    throw RaisedError(kNoObject, "No host is connected", "HostAgent");
}

CTovimarServerData& RunData() {
    if (auto* data = Session::ServerData())
        return *data;
    throw RaisedError(kNoObject, "No server is connected", "RunData");
}

HostMeter::HostMeter(const std::string& message, std::int32_t maximum) {
    HostAgent().ProgressMeterInit(message, maximum);
}
HostMeter::~HostMeter() {
    PassOver([] { HostAgent().ProgressMeterRemove(); });
}
void HostMeter::Update(std::int32_t value) {
    HostAgent().ProgressMeterUpdate(value);
}

Hourglass::Hourglass() {
    HostAgent().HourglassOn();
}
Hourglass::~Hourglass() {
    PassOver([] { HostAgent().HourglassOff(); });
}

ProgressWindow::ProgressWindow(const std::string& message, std::int32_t maximum) {
    RunData().ProgressBarInit(message, maximum);
}
ProgressWindow::~ProgressWindow() {
    PassOver([] { RunData().ProgressBarDispose(); });
}
void ProgressWindow::Update(const std::string& message, std::int32_t value) {
    RunData().ProgressBarUpdate(message, value);
}

void TraceText(const std::function<std::string()>& text) {
    auto* log = Session::TraceLog();
    if (log->IsOn())
        log->addMessage(text());
}

void TraceTimestamp(const char* text) {
    TraceText([text] { return LongDateAndTime() + ": Timestamp - " + text; });
}

std::string LongDateAndTime(const platform::DateTime& time) {
    constexpr std::array<const char*, 12> kMonths{"January",   "February", "March",    "April",
                                                  "May",       "June",     "July",     "August",
                                                  "September", "October",  "November", "December"};
    std::array<char, 64> buffer{};
    std::snprintf(buffer.data(), buffer.size(), "%s %d, %d %02d:%02d:%02d",
                  kMonths.at(static_cast<std::size_t>(time.month - 1)), time.day, time.year, time.hour,
                  time.minute, time.second);
    return buffer.data();
}

std::string LongDateAndTime() {
    return LongDateAndTime(platform::Env().clock->Now());
}

} // namespace tovimar
