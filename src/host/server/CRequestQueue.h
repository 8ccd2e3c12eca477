#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

namespace tovimar {

/// A hidden form with a one-shot timer.
class frmTimer {
public:
    frmTimer() = default;
    ~frmTimer();
    frmTimer(const frmTimer&) = delete;
    frmTimer& operator=(const frmTimer&) = delete;

    /// In milliseconds; starts the timer.
    void SetInterval(std::int32_t interval);
    /// Called once; the timer doesn't run any more then.
    std::function<void()> Tick;

private:
    void Disable();

    std::int32_t timer_ = 0;
};

/// An action's name that comes back after a while.
class CTimer {
public:
    /// In milliseconds.
    void SetTimer(std::int32_t Interval, const std::string& vstrActionName);
    /// Called with the action's name. The timer may be ended from within.
    std::function<void(const std::string&)> Tick;

private:
    std::string actionName_;
    std::unique_ptr<frmTimer> form_;
};

/// Delays what an object can't do at once because it would destroy its caller: a dialog that is closed and
/// opened again from within its own event. Holds one action; a second one takes its place.
class CRequestQueue {
public:
    /// "ReloadWizardForm" closes the wizard and opens a new one; other names do nothing.
    void Queue(const std::string& vstrActionName);

private:
    void myTimer_Tick(const std::string& actionName);

    std::unique_ptr<CTimer> myTimer_;
};

} // namespace tovimar
