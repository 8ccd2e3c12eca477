#pragma once

#include <functional>

namespace tovimar {

/// The short sound that goes with a refusal; silent in a program without one.
void Beep();
/// What makes it. An empty function takes it away.
void SetBeep(std::function<void()> sound);

} // namespace tovimar
