/// `hhc.exe PROJECT.hhp`: the help compiler. The compiled file stands in the project's folder, or where the
/// project says. With TOVIMAR_HELP_COMPILER=chmcmd in the environment the compiler of that name does the
/// work. Exit code 0: compiled; 1: compiled with complaints, or not at all; 2: no project or no compiler;
/// 130: interrupted, with the earlier file as it was.
#include "ChmcmdCompiler.h"
#include "helpcompiler/Compiler.h"
#include "platform/Error.h"

#include <charconv>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <optional>
#include <string>

namespace {
namespace fs = std::filesystem;
using tovimar::helpcompiler::Message;

/// "hhc: warning: Orders.htm(12): ..."
void Print(const Message& message) {
    std::string place = message.file;
    if (message.line > 0)
        place += "(" + std::to_string(message.line) + ")";
    std::fprintf(stderr, "hhc: warning: %s: %s\n", place.c_str(), message.text.c_str());
}

volatile std::sig_atomic_t interrupted = 0;

void CatchSignals() {
    struct sigaction action {};
    action.sa_handler = [](int) { interrupted = 1; };
    for (const int number : {SIGINT, SIGTERM, SIGHUP})
        sigaction(number, &action, nullptr);
}

std::optional<std::uint32_t> FixedTime() {
    const char* given = std::getenv("SOURCE_DATE_EPOCH");
    std::uint32_t seconds = 0;
    if (given == nullptr || std::from_chars(given, given + std::strlen(given), seconds).ec != std::errc())
        return std::nullopt;
    return seconds;
}

int Compile(const fs::path& project) {
    const auto result =
        tovimar::helpcompiler::Compile(project, {0, FixedTime(), [] { return interrupted != 0; }}, Print);
    if (result.file.empty())
        return 1;
    std::printf("%s: %zu topics, %llu bytes\n", result.file.c_str(), result.topics,
                static_cast<unsigned long long>(result.bytes));
    return result.complaints ? 1 : 0;
}

} // namespace

int main(int count, char** arguments) {
    if (count != 2)
        return hhc::Fail(2, "usage: hhc.exe PROJECT.hhp");
    try {
        const fs::path project = fs::absolute(arguments[1]);
        const char* other = std::getenv("TOVIMAR_HELP_COMPILER");
        if (other != nullptr && std::strcmp(other, "chmcmd") == 0)
            return hhc::CompileWithChmcmd(project);
        if (!fs::is_regular_file(project))
            return hhc::Fail(2, "can't read the project '" + project.string() + "'");
        CatchSignals();
        return Compile(project);
    } catch (const tovimar::helpcompiler::Interrupted&) {
        return 130;
    } catch (const std::exception& failure) {
        return hhc::Fail(1, failure.what());
    }
}
