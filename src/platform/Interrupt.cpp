#include "platform/Interrupt.h"

#include <atomic>
#include <csignal>

namespace tovimar::platform {
namespace {

std::atomic<bool> requested = false;
static_assert(std::atomic<bool>::is_always_lock_free, "a signal handler sets it");

void OnSignal(int number) {
    if (requested.exchange(true)) {
        std::signal(number, SIG_DFL);
        std::raise(number);
    }
}

} // namespace

void InstallInterruptHandler() {
    struct sigaction action {};
    action.sa_handler = OnSignal;
    // Output that waits for its reader goes on; the run looks at the flag itself.
    action.sa_flags = SA_RESTART;
    sigemptyset(&action.sa_mask);
    sigaction(SIGINT, &action, nullptr);
    sigaction(SIGTERM, &action, nullptr);
}

bool InterruptRequested() {
    return requested.load();
}

void ClearInterrupt() {
    requested = false;
}

void RequestInterrupt() {
    requested = true;
}

} // namespace tovimar::platform
