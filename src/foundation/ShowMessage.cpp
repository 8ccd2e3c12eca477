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

/// The partner of the quote or bracket in front of a path; 0 without one.
char CloserAt(const std::string& text, std::size_t at) {
    switch (at == 0 ? ' ' : text[at - 1]) {
    case '\'':
        return '\'';
    case '[':
        return ']';
    case '(':
        return ')';
    default:
        return '\0';
    }
}

/// Names hold quotes and brackets too: "'Z:\Bob's help\a.htm'".
bool GoesOnBehind(const std::string& text, std::size_t closer) {
    if (closer + 1 >= text.size())
        return false;
    const char next = text::LowerAscii(text[closer + 1]);
    return next == '\\' || (next >= 'a' && next <= 'z') || (next >= '0' && next <= '9') ||
           static_cast<unsigned char>(next) >= 0x80;
}

/// Where the path that begins at `at` ends.
std::size_t PathEnd(const std::string& text, std::size_t at) {
    const char closer = CloserAt(text, at);
    const std::string_view ends = closer != '\0' ? "\r\n" : "\"<>|\r\n";
    for (std::size_t i = at + 1; i < text.size(); ++i) {
        if (ends.find(text[i]) != std::string_view::npos)
            return i;
        if (closer != '\0' ? text[i] == closer && !GoesOnBehind(text, i) : IsPathStart(text, i))
            return i;
    }
    return text.size();
}

} // namespace

std::string NativePathsInText(const std::string& text) {
    std::string out;
    for (std::size_t i = 0; i < text.size();) {
        if (!IsPathStart(text, i)) {
            out += text[i++];
            continue;
        }
        const std::size_t end = PathEnd(text, i);
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
