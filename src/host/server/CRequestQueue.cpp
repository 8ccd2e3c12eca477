#include "host/server/CRequestQueue.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarActions.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"

#include <utility>

namespace tovimar {

frmTimer::~frmTimer() {
    Disable();
}

void frmTimer::Disable() {
    if (timer_ != 0)
        platform::Env().timers->Stop(std::exchange(timer_, 0));
}

void frmTimer::SetInterval(std::int32_t interval) {
    Disable();
    timer_ = platform::Env().timers->Start(interval, [this] {
        timer_ = 0;
        // The call may end this form.
        if (const auto tick = Tick)
            tick();
    });
}

void CTimer::SetTimer(std::int32_t Interval, const std::string& vstrActionName) {
    actionName_ = vstrActionName;
    form_ = std::make_unique<frmTimer>();
    form_->Tick = [this] {
        const auto over = std::move(form_);
        const auto tick = Tick;
        const std::string name = actionName_;
        if (tick)
            tick(name);
    };
    form_->SetInterval(Interval);
}

void CRequestQueue::Queue(const std::string& vstrActionName) {
    constexpr std::int32_t kDelay = 100;
    myTimer_ = std::make_unique<CTimer>();
    myTimer_->Tick = [this](const std::string& actionName) { myTimer_Tick(actionName); };
    myTimer_->SetTimer(kDelay, vstrActionName);
}

void CRequestQueue::myTimer_Tick(const std::string& actionName) {
    myTimer_.reset();
    if (actionName != "ReloadWizardForm" || Session::Server() == nullptr)
        return;
    Trapped("CRequestQueue", "myTimer_Tick", [] {
        Session::Server()->Actions().CloseWizardFormOnDisconnection();
        HostAgent().Doevents();
        Session::Server()->OpenNewProject();
    });
}

} // namespace tovimar
