#include "platform/MessageBoxAnswers.h"

namespace tovimar::platform {

int DefaultMessageBoxAnswer(std::uint32_t flags) {
    // One row per button set, one column per default button; 0 where the box has no such button.
    static constexpr int kAnswers[6][3] = {
        {kAnswerOk, kAnswerOk, kAnswerOk},
        {kAnswerOk, kAnswerCancel, 0},
        {kAnswerAbort, kAnswerRetry, kAnswerIgnore},
        {kAnswerYes, kAnswerNo, kAnswerCancel},
        {kAnswerYes, kAnswerNo, 0},
        {kAnswerRetry, kAnswerCancel, 0},
    };
    const std::uint32_t buttons = flags & 7U;
    const std::uint32_t position = (flags & 1792U) >> 8U;
    const int* row = kAnswers[buttons < 6 ? buttons : 0];
    return position < 3 && row[position] != 0 ? row[position] : row[0];
}

} // namespace tovimar::platform
