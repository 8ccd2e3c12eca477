#pragma once

#include "platform/MessageBoxAnswers.h"

#include <cstdint>
#include <string>

namespace tovimar {

class CTraceLog;

/// Flags of a message box: buttons, icon, default button.
enum MessageFlags : std::uint32_t {
    kMsgOk = 0,
    kMsgOkCancel = 1,
    kMsgAbortRetryIgnore = 2,
    kMsgYesNoCancel = 3,
    kMsgYesNo = 4,
    kMsgRetryCancel = 5,
    kMsgCritical = 16,
    kMsgQuestion = 32,
    kMsgExclamation = 48,
    kMsgInformation = 64,
    kMsgDefaultSecond = 256,
    kMsgDefaultThird = 512,
};

using platform::MessageBoxAnswer;

/// The one road to a message box. Gives the pressed button (platform::kAnswerYes, ...). In unattended mode
/// no box appears, the default button answers, and message and answer are traced. A warning that only
/// tells (exclamation icon, OK button) counts in the run state's `warningCount`.
int ShowMessage(const std::string& message, std::uint32_t flags, const std::string& title,
                const std::string& helpFile = {}, std::int32_t helpContext = 0,
                const std::string& source = {});

/// Unattended mode and the log that its answers go to (null: none; not owned).
void SetUnattendedMessages(bool vfOn, CTraceLog* robjLog);
bool UnattendedMessages();

/// A warning for the user, traced as "UserWarningMessage: " + text. Never fails.
void UserWarningMessage(const std::string& vstrText);

/// A text for a person: Windows paths in it ("Z:\a\b", "C:\a\b") become native ones. A path behind a quote
/// or bracket ends at its partner, any other at the next path or the end of the line.
std::string NativePathsInText(const std::string& text);

} // namespace tovimar
