#include "foundation/ShowMessage.h"

#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/text/CodePoints.h"

namespace tovimar {
namespace {

struct Unattended {
    bool on = false;
    CTraceLog* log = nullptr;
};

Unattended& Mode() {
    static Unattended mode;
    return mode;
}

std::string AnswerName(int answer) {
    static constexpr const char* kNames[] = {"",        "vbOK",     "vbCancel", "vbAbort",
                                             "vbRetry", "vbIgnore", "vbYes",    "vbNo"};
    return answer >= 1 && answer <= 7 ? kNames[answer] : "";
}

bool IsWarning(std::uint32_t flags) {
    return (flags & 0x70U) == kMsgExclamation && (flags & 7U) == kMsgOk;
}

bool IsPathStart(const std::string& text, std::size_t at) {
    const char drive = text::LowerAscii(text[at]);
    if ((drive != 'c' && drive != 'z') || text.compare(at + 1, 2, ":\\") != 0)
        return false;
    const char before = at == 0 ? ' ' : text::LowerAscii(text[at - 1]);
    return !(before >= 'a' && before <= 'z') && !(before >= '0' && before <= '9');
}

/// What ends a path that begins at `at`: the partner of the quote or bracket in front, or a character that
/// no path holds.
const char* PathEnds(const std::string& text, std::size_t at) {
    switch (at == 0 ? ' ' : text[at - 1]) {
    case '\'':
        return "'\r\n";
    case '[':
        return "]\r\n";
    case '(':
        return ")\r\n";
    default:
        return "\"<>|\r\n";
    }
}

} // namespace

std::string NativePathsInText(const std::string& text) {
    std::string out;
    for (std::size_t i = 0; i < text.size();) {
        if (!IsPathStart(text, i)) {
            out += text[i++];
            continue;
        }
        const std::size_t end = std::min(text.find_first_of(PathEnds(text, i), i), text.size());
        out += platform::Env().files->ToNative(text.substr(i, end - i));
        i = end;
    }
    return out;
}

int ShowMessage(const std::string& message, std::uint32_t flags, const std::string& title,
                const std::string& helpFile, std::int32_t helpContext, const std::string& source) {
    // The windows of this system have no help button; file and context stay in the call for those that will.
    (void)helpFile;
    (void)helpContext;
    if (IsWarning(flags))
        ++Session::Run().warningCount;
    if (!Mode().on)
        return platform::Env().messageBoxes->Show(NativePathsInText(message), flags, title);
    const int answer = platform::DefaultMessageBoxAnswer(flags);
    if (Mode().log != nullptr)
        Mode().log->addMessage(message + ", source = " + source + " => " + AnswerName(answer));
    return answer;
}

void SetUnattendedMessages(bool vfOn, CTraceLog* robjLog) {
    Mode() = {vfOn, robjLog};
}

bool UnattendedMessages() {
    return Mode().on;
}

void UserWarningMessage(const std::string& vstrText) {
    PassOver([&] {
        ShowMessage(vstrText, kMsgExclamation, TitleAndVersion(), {}, 0, "mErrorMessage.UserWarningMessage");
        Session::TraceLog()->addMessage("UserWarningMessage: " + vstrText);
    });
}

} // namespace tovimar
