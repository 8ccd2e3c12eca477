#include "foundation/ErrorTrap.h"

#include "foundation/CMailToProtocol.h"
#include "foundation/CTraceLog.h"
#include "foundation/Paths.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "platform/Environment.h"
#include "platform/Interrupt.h"
#include "platform/text/Text.h"

#include <cstdio>
#include <new>

namespace tovimar {
namespace {

constexpr ResultCode kOutOfMemory = 14;
constexpr ResultCode kPathAccess = 75;

std::string HintFor(ResultCode number) {
    if (number == kOutOfMemory)
        return "Your system may have run out of memory.\r\n"
               "Remove any unnecessary applications from memory to create more space.";
    if (number == kPathAccess)
        return "Error 75: Path/File access error\r\n"
               "If you are using SourceSafe, make sure your projects have been checked out";
    return {};
}

std::string JoinBlocks(const std::vector<std::string>& blocks) {
    std::string out;
    for (const auto& block : blocks) {
        if (block.empty())
            continue;
        if (!out.empty())
            out += "\r\n";
        out += block;
    }
    return out;
}

std::string MailBody(const std::string& text) {
    return "Please contact me about the following problem:\r\n\r\n\r\n"
           "DESCRIBE WHAT YOU TRY TO DO: \r\n\r\n\r\n\r\n"
           "DESCRIBE WHAT HAPPENS: \r\n\r\n\r\n\r\n" +
           text;
}

/// When no mail program takes the report, a file with it is shown instead.
void ShowReportFile(const std::string& body) {
    const auto now = platform::Env().clock->Now();
    char name[40];
    std::snprintf(name, sizeof name, "~%04d%02d%02d%02d%02d%02d.txt", now.year, now.month, now.day, now.hour,
                  now.minute, now.second);
    const std::string path = TemporaryFolder() + name;
    platform::Env().files->WriteFile(path, "Please send the following error to " +
                                               std::string(kSupportAddress) + "\r\n---\r\n\r\n" + body);
    platform::Env().processes->Open(path);
}

void OfferReport(const std::string& text, const std::string& caption) {
    Session::TraceLog()->addMessage(text, /*vfIsErrMessage=*/true);
    std::uint32_t flags = kMsgYesNo | kMsgCritical;
    IRunContext& context = Session::Context();
    if (context.AutomatedTestModeOn() || context.WizardUnattendedExecution())
        flags |= kMsgDefaultSecond;
    const int answer = ShowMessage(text + "\r\n\r\nDo you want to report the problem?", flags, caption, {}, 0,
                                   "mErrorMessage.rErrorMessage");
    if (answer != platform::kAnswerYes)
        return;
    const std::string subject =
        "Runtime error in " + std::string(kApplicationTitle) + " (" + kProductName + ")";
    const std::string body = MailBody(text);
    const ResultCode sent =
        CMailToProtocol().Send(kSupportAddress, text::ReplaceAll(subject, "&", ""),
                               text::ReplaceAll(body, "&", ""), {}, {}, /*vfTruncate=*/true);
    if (sent != 0)
        ShowReportFile(body);
}

RaisedError AsRaisedError(const std::exception& failure) {
    if (const auto* raised = dynamic_cast<const RaisedError*>(&failure))
        return raised->Number() != 0 ? *raised
                                     : RaisedError(kGeneralFailure, raised->what(), raised->Source());
    if (dynamic_cast<const std::bad_alloc*>(&failure) != nullptr)
        return {kOutOfMemory, "Out of memory"};
    return {kGeneralFailure, failure.what()};
}

} // namespace

void rErrorMessage(ResultCode number, int line, const std::string& description, const std::string& detail,
                   const std::string& className, const std::string& operationName, bool reportFlag) {
    std::string location;
    if (!className.empty() || !operationName.empty())
        location = "\r\n in " + className + "." + operationName;
    const std::string caption = "Error: " + TitleAndVersion();
    std::string text = description;
    if (number != 0 || line != 0)
        text = "Error " + std::to_string(number) + ": " + description + " " + location + " line " +
               std::to_string(line) + " \r\n\r\n" + detail;
    if (!reportFlag)
        ShowMessage(text, kMsgCritical, caption, {}, 0, "mErrorMessage.rErrorMessage");
    else
        OfferReport(text.substr(0, text.find('@')), caption);
}

void ReportError(const RaisedError& error, const std::string& className, const std::string& operationName,
                 const std::string& detail) {
    ++Session::Run().runErrorCount;
    PassOver([&] {
        rErrorMessage(error.Number(), 0, error.what(),
                      JoinBlocks({detail, HintFor(error.Number()), SystemDescription()}), className,
                      operationName,
                      /*reportFlag=*/true);
    });
}

ResultCode Trapped(const char* className, const char* operationName, const std::function<void()>& operation) {
    return Trapped(className, operationName, operation, [] { return std::string(); });
}

ResultCode Trapped(const char* className, const char* operationName, const std::function<void()>& operation,
                   const std::function<std::string()>& detail) {
    try {
        operation();
        return kSuccess;
    } catch (const std::exception& failure) {
        const RaisedError error = AsRaisedError(failure);
        if (error.Number() == kGeneralFailure &&
            (platform::InterruptRequested() || Session::Run().generationInterrupted)) {
            Session::Run().generationInterrupted = true;
            return kGeneralFailure;
        }
        std::string text;
        PassOver([&] { text = detail(); });
        ReportError(error, className, operationName, text);
        return error.Number();
    }
}

bool StopRequested() {
    platform::Env().doEvents();
    return Session::Run().generationInterrupted;
}

void LeaveIfInterrupted() {
    if (StopRequested())
        throw RaisedError(kGeneralFailure, "The run was stopped.");
}

void PassOver(const std::function<void()>& step) {
    try {
        step();
    } catch (const std::exception&) {
        // Whoever passes a step over has nobody to tell; what follows matters more.
        return;
    }
}

} // namespace tovimar
