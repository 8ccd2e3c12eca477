#include "cli/Console.h"

#include "cli/Question.h"
#include "foundation/ShowMessage.h"
#include "platform/MessageBoxAnswers.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <cstdio>
#include <sys/ioctl.h>
#include <unistd.h>

namespace tovimar::cli {
namespace {

constexpr std::uint32_t kButtons = 7;
constexpr std::uint32_t kIcons = 0x70;

/// Control characters of foreign names would steer the terminal.
std::string Printable(const std::string& text) {
    std::string printable;
    for (const char c : text::MakeValidUtf8(text)) {
        const auto byte = static_cast<unsigned char>(c);
        if (c == '\n' || c == '\t' || (byte >= 32 && byte != 127))
            printable += c;
        else if (c != '\r')
            printable += '?';
    }
    return printable;
}

void Print(std::FILE* stream, const char* prefix, const std::string& text) {
    std::string shown = Printable(text);
    shown.erase(shown.find_last_not_of(" \n") + 1);
    const std::string indent = *prefix == '\0' ? "" : "  ";
    std::string lead = prefix;
    for (const std::string& line : text::Split(shown, "\n")) {
        std::fprintf(stream, "%s%s\n", line.empty() ? "" : lead.c_str(), line.c_str());
        lead = indent;
    }
    std::fflush(stream);
}

int TerminalWidth() {
    winsize size{};
    return ioctl(STDERR_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_col > 20 ? size.ws_col : 80;
}

/// The first line of a reported failure says what went wrong; place in the program and system are for a
/// report.
std::string Shortened(const std::string& text) {
    const auto place = text.find(" \r\n in ");
    return text.substr(0, place == std::string::npos ? text.find("\r\n\r\n[") : place);
}

bool OffersReport(const std::string& text) {
    return text::EndsWithIgnoringCase(text, "report the problem?");
}

} // namespace

void PrintError(const std::string& text) {
    Print(stderr, "tovimar: error: ", text);
}
void PrintWarning(const std::string& text) {
    Print(stderr, "tovimar: warning: ", text);
}
void PrintHint(const std::string& text) {
    Print(stderr, "", text);
}
void PrintResult(const std::string& text) {
    Print(stdout, "", text);
}
void PrintPrompt(const std::string& text) {
    std::fprintf(stderr, "%s ", Printable(text).c_str());
    std::fflush(stderr);
}
void PrintRaw(const std::string& bytes) {
    std::fwrite(bytes.data(), 1, bytes.size(), stdout);
    std::fflush(stdout);
}

ProgressLine::ProgressLine(bool verbose) : terminal_(isatty(STDERR_FILENO) != 0), verbose_(verbose) {}

void ProgressLine::Phase(const std::string& text) {
    bar_.clear();
    if (terminal_ && !verbose_)
        Draw(text);
    else
        PrintHint(text);
}

void ProgressLine::Object(const std::string& kind, const std::string& name, int position, int maximum) {
    const std::string object = kind.empty() ? name : kind + " " + name;
    if (verbose_)
        PrintHint(object);
    else if (terminal_) {
        constexpr int kBar = 24;
        const int most = std::max(maximum, 1);
        const auto filled = static_cast<std::size_t>(kBar * std::min(position, most) / most);
        bar_ = "[" + std::string(filled, '#') + std::string(kBar - filled, '-') + "] " +
               std::to_string(position) + "/" + std::to_string(most) + " ";
        Draw(bar_ + object);
    }
}

void ProgressLine::Detail(const std::string& text) {
    if (terminal_ && !verbose_)
        Draw(bar_ + text);
}

void ProgressLine::Draw(const std::string& text) {
    const std::string line = text::Left(text::ReplaceAll(Printable(text), "\n", " "),
                                        static_cast<std::size_t>(TerminalWidth() - 1));
    std::fprintf(stderr, "\r\033[K%s", line.c_str());
    std::fflush(stderr);
    drawn_ = true;
}

void ProgressLine::Clear() {
    if (!drawn_)
        return;
    std::fputs("\r\033[K", stderr);
    std::fflush(stderr);
    drawn_ = false;
}

void ConsoleMessageBoxes::Tell(const std::string& text, std::uint32_t flags) {
    const std::uint32_t icon = flags & kIcons;
    if (icon == kMsgCritical || (warningsStop && (icon == kMsgExclamation || icon == 0))) {
        PrintError(text);
        ++errors;
    } else if (icon == kMsgExclamation || icon == kMsgQuestion)
        PrintWarning(text);
    else
        PrintResult(text);
}

int ConsoleMessageBoxes::Show(const std::string& text, std::uint32_t flags, const std::string&) {
    progress_.Clear();
    const bool report = OffersReport(text);
    const std::string native = NativePathsInText(report && !verbose_ ? Shortened(text) : text);
    if (report || (flags & kButtons) == kMsgOk) {
        Tell(native, flags);
        return report ? platform::kAnswerNo : platform::kAnswerOk;
    }
    if (mayAsk_)
        return AskOnTerminal(native, flags);
    // Going on over a locked file would only fail later.
    if ((flags & kButtons) == kMsgOkCancel && warningsStop) {
        Tell(native, flags);
        return platform::kAnswerCancel;
    }
    const int answer = platform::DefaultMessageBoxAnswer(flags);
    PrintWarning(native + "\n(answered by itself: " + AnswerWord(answer) + ")");
    return answer;
}

} // namespace tovimar::cli
