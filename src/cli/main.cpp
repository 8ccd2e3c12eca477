/// The command `tovimar`.
#include "cli/CommandLine.h"
#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Surroundings.h"
#include "foundation/ShowMessage.h"
#include "platform/Interrupt.h"
#include "platform/Memory.h"

#include <exception>

namespace tovimar::cli {
namespace {

int Run(const Arguments& arguments) {
    Surroundings surroundings(arguments.verbose);
    try {
        if (const std::string missing = surroundings.MissingInstallation(); !missing.empty()) {
            PrintError(missing);
            return kFailed;
        }
        switch (arguments.command) {
        case Arguments::Command::Generate:
            return Generate(arguments, surroundings);
        case Arguments::Command::Screenshot:
            return RetakeScreenshot(arguments, surroundings);
        case Arguments::Command::List:
            return List(arguments);
        default:
            return ShowOptions();
        }
    } catch (const std::exception& failure) {
        surroundings.Progress().Clear();
        if (platform::InterruptRequested()) {
            PrintError("interrupted");
            return kInterrupted;
        }
        PrintError(NativePathsInText(failure.what()));
        return kFailed;
    }
}

} // namespace
} // namespace tovimar::cli

int main(int count, char** arguments) {
    tovimar::platform::KeepFreedMemory();
    const auto parsed = tovimar::cli::ParseCommandLine(count, arguments);
    return parsed.ended ? parsed.exitCode : tovimar::cli::Run(parsed);
}
