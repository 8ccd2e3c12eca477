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

int RunCommand(const Arguments& arguments, Surroundings& surroundings) {
    using Command = Arguments::Command;
    switch (arguments.command) {
    case Command::New:
        return CreateProject(arguments, surroundings);
    case Command::Generate:
        return Generate(arguments, surroundings);
    case Command::Regenerate:
        return Regenerate(arguments, surroundings);
    case Command::Recompile:
        return Recompile(arguments, surroundings);
    case Command::Screenshot:
        return RetakeScreenshot(arguments, surroundings);
    case Command::Open:
        return Open(arguments, surroundings);
    case Command::ListProjects:
        return ListProjects(arguments);
    case Command::ForgetProject:
        return ForgetProject(arguments, surroundings);
    case Command::Contents:
        return ShowContents(arguments, surroundings);
    case Command::Tree:
        return EditTree(arguments, surroundings);
    case Command::ListSettings:
        return ListSettings(arguments, surroundings);
    case Command::GetSetting:
        return GetSetting(arguments, surroundings);
    case Command::SetSetting:
        return SetSetting(arguments, surroundings);
    case Command::List:
        return List(arguments);
    case Command::ConvertContents:
        return ConvertContents(arguments, surroundings);
    case Command::Inspect:
        return InspectDatabase(arguments, surroundings);
    case Command::ExportTexts:
        return ExportTexts(arguments, surroundings);
    default:
        return ShowOptions();
    }
}

int Run(const Arguments& arguments) {
    Surroundings surroundings(arguments);
    try {
        if (const std::string missing = surroundings.MissingInstallation(); !missing.empty()) {
            PrintError(missing);
            return kFailed;
        }
        return RunCommand(arguments, surroundings);
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
