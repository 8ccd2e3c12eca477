#include "foundation/Beep.h"

#include <utility>

namespace tovimar {
namespace {

std::function<void()>& Sound() {
    static std::function<void()> sound;
    return sound;
}

} // namespace

void Beep() {
    if (Sound())
        Sound()();
}

void SetBeep(std::function<void()> sound) {
    Sound() = std::move(sound);
}

} // namespace tovimar
