#include "cli/Question.h"

#include "cli/Console.h"
#include "cli/Stop.h"
#include "foundation/ShowMessage.h"
#include "platform/Interrupt.h"
#include "platform/MessageBoxAnswers.h"
#include "platform/text/Text.h"

#include <array>
#include <cerrno>
#include <poll.h>
#include <unistd.h>
#include <vector>

namespace tovimar::cli {
namespace {

constexpr std::uint32_t kButtons = 7;
constexpr std::array<const char*, 8> kWords{"", "ok", "cancel", "abort", "retry", "ignore", "yes", "no"};

std::vector<int> Answers(std::uint32_t flags) {
    using namespace platform;
    switch (flags & kButtons) {
    case kMsgOkCancel:
        return {kAnswerOk, kAnswerCancel};
    case kMsgAbortRetryIgnore:
        return {kAnswerAbort, kAnswerRetry, kAnswerIgnore};
    case kMsgYesNoCancel:
        return {kAnswerYes, kAnswerNo, kAnswerCancel};
    case kMsgYesNo:
        return {kAnswerYes, kAnswerNo};
    case kMsgRetryCancel:
        return {kAnswerRetry, kAnswerCancel};
    default:
        return {kAnswerOk};
    }
}

/// "[YES/no]"
std::string Choices(const std::vector<int>& answers, int byDefault) {
    std::vector<std::string> words;
    for (const int answer : answers)
        words.push_back(answer == byDefault ? text::ToUpper(AnswerWord(answer)) : AnswerWord(answer));
    return "[" + text::Join(words, "/") + "]";
}

/// One line without its end. Ctrl+C only sets a flag, so the wait is cut into short ones.
std::string ReadLine() {
    constexpr int kMilliseconds = 100;
    std::string line;
    for (;;) {
        StopIfInterrupted();
        pollfd input{STDIN_FILENO, POLLIN, 0};
        if (poll(&input, 1, kMilliseconds) <= 0)
            continue;
        char byte = 0;
        const ssize_t got = read(STDIN_FILENO, &byte, 1);
        if (got < 0 && errno == EINTR)
            continue;
        if (got <= 0)
            throw Stop{"no answer", kInterrupted};
        if (byte == '\n')
            return line;
        line += byte;
    }
}

/// 0 for a word that is no answer.
int Understood(const std::string& typed, const std::vector<int>& answers, int byDefault) {
    const std::string word = text::TrimWhitespace(typed);
    if (word.empty())
        return byDefault;
    for (const int answer : answers)
        if (text::StartsWithIgnoringCase(AnswerWord(answer), word))
            return answer;
    return 0;
}

} // namespace

bool HasTerminal() {
    return isatty(STDIN_FILENO) != 0 && isatty(STDERR_FILENO) != 0;
}

std::string AnswerWord(int answer) {
    return answer > 0 && static_cast<std::size_t>(answer) < kWords.size()
               ? kWords[static_cast<std::size_t>(answer)]
               : "";
}

int AskOnTerminal(const std::string& text, std::uint32_t flags) {
    const std::vector<int> answers = Answers(flags);
    const int byDefault = platform::DefaultMessageBoxAnswer(flags);
    PrintPrompt(text + " " + Choices(answers, byDefault));
    for (;;) {
        std::string typed;
        try {
            typed = ReadLine();
        } catch (const Stop&) {
            PrintHint("\n");
            throw;
        }
        if (const int answer = Understood(typed, answers, byDefault); answer != 0)
            return answer;
        PrintPrompt("Please answer " + Choices(answers, byDefault));
    }
}

} // namespace tovimar::cli
