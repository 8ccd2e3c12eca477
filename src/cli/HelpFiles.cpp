#include "cli/HelpFiles.h"

#include "cli/CommandLine.h"
#include "cli/Console.h"
#include "cli/Stop.h"
#include "foundation/CAddInProject.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarCompiler.h"
#include "generation/HelpUtilities.h"
#include "host/server/CTovimarServer.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <cstddef>
#include <cstdio>

namespace tovimar::cli {

void CheckCompiler() {
    if (!Session::Parameters()->CompileHTMLHelp)
        return;
    if (GetHtmlHelpWorkshopExePath().empty())
        throw Stop{"the help compiler isn't installed; nothing was written\n"
                   "It is the file hhc.exe beside the command; --no-compile writes everything but the .chm."};
    TheServer().TestThatHtmlWorkshopInstalled();
}

std::string CopyComplaint(const Arguments& arguments) {
    if (!Session::Parameters()->CompileHTMLHelp)
        return {};
    auto& files = *platform::Env().files;
    const std::string copied = platform::FolderOf(CTovimarCompiler().GetCopiedHelpFullPath());
    if (!arguments.copyTo.empty() && !CreateFolderPath(copied))
        return "the folder '" + files.ToNative(copied) + "' of --copy-to can't be made";
    if (!TestFolderWritable(copied))
        return "no write access to '" + files.ToNative(copied) +
               "', where the copy of the compiled help goes\n--copy-to names another folder, --no-compile "
               "makes none.";
    return {};
}

static std::ptrdiff_t WarningsIn(const std::string& output) {
    const auto lines = text::Split(output, "\n");
    return std::count_if(lines.begin(), lines.end(),
                         [](const std::string& line) { return line.starts_with("hhc: warning: "); });
}

bool CompilerSucceeded(bool verbose) {
    const auto& generator = *Session::Generator();
    const bool compiled = platform::Env().files->FileExists(Session::Parameters()->CompiledHelpFullPath());
    if (Session::Parameters()->CompileHTMLHelp && (!compiled || generator.CompilerExitCode != 0)) {
        PrintError((compiled ? "the help compiler had complaints:\n" : "the help compiler made no file:\n") +
                   generator.CompilerOutput);
        return false;
    }
    if (generator.CompilerOutput.empty())
        return true;
    if (verbose)
        PrintHint(generator.CompilerOutput);
    else if (const auto warnings = WarningsIn(generator.CompilerOutput); warnings > 0)
        PrintHint("The help compiler has " + std::to_string(warnings) +
                  (warnings == 1 ? " warning; --verbose shows it." : " warnings; --verbose shows them."));
    return true;
}

/// "1.4 MB, compiled in 0.2 seconds"
static std::string SizeAndTime(const std::string& file) {
    constexpr double kMegabyte = 1e6;
    char text[80];
    std::snprintf(text, sizeof text, "%.1f MB, compiled in %.1f seconds",
                  static_cast<double>(platform::Env().files->FileLength(file)) / kMegabyte,
                  Session::Generator()->CompilerSeconds);
    return text;
}

void ShowCompiledHelp() {
    if (!Session::Parameters()->CompileHTMLHelp)
        return;
    const std::string compiled = Session::Parameters()->CompiledHelpFullPath();
    const std::string copied = CTovimarCompiler().GetCopiedHelpFullPath();
    ShowFile("Compiled help: ", compiled);
    if (platform::Env().files->FileExists(compiled))
        PrintResult("               " + SizeAndTime(compiled));
    if (!text::EqualsIgnoringCase(compiled, copied))
        ShowFile("Copied to:     ", copied);
}

void ShowWebHelpAndProject() {
    ShowFile("Web help:      ", platform::Join(Session::CurrentProject()->Folder, "main.htm"));
    ShowFile("Project:       ", Session::CurrentProject()->TvpFullPath());
}

} // namespace tovimar::cli
