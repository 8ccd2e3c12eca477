#pragma once

#include "foundation/Session.h"
#include "platform/Environment.h"

#include <cstdint>
#include <memory>
#include <string_view>
#include <utility>

/// Surroundings of a target: a clock that stands, boxes that say No, programs that aren't started.
namespace tovimar::fuzz {

class StandingClock : public platform::Clock {
public:
    platform::DateTime Now() override { return {2026, 1, 2, 3, 4, 5, 11045}; }
    double Timer() override { return 11045; }
};

class SilentBoxes : public platform::MessageBoxes {
public:
    int Show(const std::string&, std::uint32_t, const std::string&) override {
        constexpr int kNo = 7;
        return kNo;
    }
};

class NoProcesses : public platform::Processes {
public:
    Outcome RunAndWait(const std::string&) override { return {}; }
    bool Open(const std::string&) override { return false; }
};

/// Once per process; the installation is that of the source tree. Every call forgets the failures counted so
/// far, which would stop a run.
inline void Prepare() {
    static const bool prepared = [] {
        auto environment = platform::MakeRealEnvironment(
            {"/nonexistent/data", "/nonexistent/config", TOVIMAR_SOURCE_DIR "/install"});
        environment->clock = std::make_unique<StandingClock>();
        environment->messageBoxes = std::make_unique<SilentBoxes>();
        environment->processes = std::make_unique<NoProcesses>();
        platform::SetEnvironment(std::move(environment));
        return true;
    }();
    (void)prepared;
    Session::Run() = {};
}

inline std::string_view Text(const std::uint8_t* data, std::size_t size) {
    return {reinterpret_cast<const char*>(data), size};
}

} // namespace tovimar::fuzz
