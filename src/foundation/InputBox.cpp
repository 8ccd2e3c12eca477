#include "foundation/InputBox.h"

#include "foundation/CTraceLog.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"

namespace tovimar {
namespace {

InputBoxShower& Shower() {
    static InputBoxShower shower;
    return shower;
}

} // namespace

void SetInputBox(InputBoxShower shower) {
    Shower() = std::move(shower);
}

std::string InputBox(const std::string& prompt, const std::string& title, const std::string& defaultText,
                     const std::string& source) {
    const std::string answer =
        Shower() && !UnattendedMessages() ? Shower()(prompt, title, defaultText) : std::string();
    if (auto* log = Session::TraceLog())
        log->addMessage(source + ": " + prompt + " = " + answer);
    return answer;
}

} // namespace tovimar
