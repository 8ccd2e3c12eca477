#pragma once

#include <cstdint>

namespace tovimar::platform {

/// Buttons of a message box, as it returns them.
enum MessageBoxAnswer : int {
    kAnswerOk = 1,
    kAnswerCancel = 2,
    kAnswerAbort = 3,
    kAnswerRetry = 4,
    kAnswerIgnore = 5,
    kAnswerYes = 6,
    kAnswerNo = 7,
};

/// The button that Enter would press: buttons in the low 3 bits of the flags, default button in bits 8 and
/// 9. Combinations that no box has answer by their first button.
int DefaultMessageBoxAnswer(std::uint32_t flags);

} // namespace tovimar::platform
