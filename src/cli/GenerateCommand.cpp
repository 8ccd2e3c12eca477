#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/CAddInProject.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarCompiler.h"
#include "generation/HelpUtilities.h"
#include "generation/RunProgress.h"
#include "generation/SourceChanges.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/Interrupt.h"
#include "platform/access/AccessApplication.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <filesystem>
#include <optional>

namespace tovimar::cli {
namespace {

namespace fs = std::filesystem;

/// One command run: the steps in order, each stops the run by raising.
class Generation {
public:
    Generation(const Arguments& arguments, Surroundings& surroundings)
        : arguments_(arguments), surroundings_(surroundings) {}

    int Run() {
        surroundings_.Boxes().warningsStop = true;
        CheckSource();
        Connect();
        TakeOptions();
        CheckCompiler();
        Prepare();
        CheckTarget();
        surroundings_.Boxes().warningsStop = false;
        return Write();
    }

private:
    void CheckSource();
    void Connect();
    void TakeOptions();
    void TakeOption(const std::string& name, const std::string& value);
    void CheckCompiler() const;
    void Prepare();
    void CheckTarget();
    void KeepSourceChanges();
    int Write();
    int Judge(CTovimarActions::Outcome outcome);
    void ShowResult() const;
    void ShowSourceChanges() const;
    CTovimarParameters& Parameters() const { return *Session::Parameters(); }

    const Arguments& arguments_;
    Surroundings& surroundings_;
    HostObject source_;
    std::optional<SourceChanges> changes_;
    CTovimarClient client_;
    CTovimarActions actions_;
    GenerationRequest request_;
};

/// Everything is read once before the first folder is made, so that bad input leaves nothing half-written.
void Generation::CheckSource() {
    surroundings_.Progress().Phase("Reading " + arguments_.source);
    source_ = platform::access::OpenAccessApplication(arguments_.source);
    const auto application = platform::access::SummarizeApplication(source_);
    StopIfInterrupted();
    surroundings_.Progress().Clear();
    std::size_t broken = 0;
    for (const auto& object : application.objects)
        if (!object.error.empty()) {
            PrintError(object.error);
            ++broken;
        }
    if (broken > 0)
        throw Stop{std::to_string(broken) + " of " + std::to_string(application.objects.size()) +
                   " objects of '" + FullPath(arguments_.source) + "' can't be read; nothing was written"};
    for (const std::string& note : application.notes)
        PrintWarning(note);
}

void Generation::Connect() {
    RegisterSettingsLoader();
    if (client_.Connect(source_) != kSuccess)
        throw Stop{"'" + FullPath(arguments_.source) + "' can't be opened"};
    auto& generator = RunData().Generator();
    generator.NodeStarted = [this](const NodeProgress& node) {
        surroundings_.Progress().Object(node.kind, node.name, node.position, node.maximum);
    };
    generator.CompilerStarted = [this] { surroundings_.Progress().Phase("Compiling help"); };
    RunData().LoadSettings();
    StopIfInterrupted();
}

void Generation::TakeOptions() {
    for (const auto& [name, value] : arguments_.options)
        TakeOption(name, value);
    auto& settings = *Session::Settings();
    CAddInSettings().Load(settings, /*vfLoadFromProjectFile=*/false);
    if (!arguments_.compile)
        Parameters().CompileHTMLHelp = false;
    if (arguments_.writeBack)
        Parameters().SaveApplicationChanges = true;
    if (!arguments_.output.empty())
        request_.folder = platform::Env().files->FromNative(FullPath(arguments_.output));
    if (!arguments_.copyTo.empty())
        Parameters().FolderForCopiedHelp = platform::Env().files->FromNative(FullPath(arguments_.copyTo));
}

void Generation::TakeOption(const std::string& name, const std::string& value) {
    if (name == "HelpProjectName")
        request_.projectName = value;
    else if (name == "HelpProjectTitle")
        request_.title = value;
    else if (name == "Application")
        request_.application = value;
    else if (name == "FolderForGeneratedHelp")
        request_.folder = platform::Env().files->FromNative(FullPath(value));
    else if (name == "CSSFullPath" && value.find('/') != std::string::npos)
        Session::Settings()->SetOptionValue(name, Value(platform::Env().files->FromNative(FullPath(value))));
    else
        Session::Settings()->SetOptionValue(name, Value(value));
}

void Generation::CheckCompiler() const {
    if (!Parameters().CompileHTMLHelp)
        return;
    if (GetHtmlHelpWorkshopExePath().empty())
        throw Stop{
            "the help compiler isn't installed; nothing was written\n"
            "Install the Debian package fp-utils (it has chmcmd), or pass --no-compile to write everything "
            "but the .chm."};
    TheServer().TestThatHtmlWorkshopInstalled();
}

void Generation::Prepare() {
    if (request_.folder.empty()) {
        std::string name = request_.projectName;
        if (name.empty())
            name = platform::BaseNameOf(Session::Context().CurrentSourceProjectFullPath());
        request_.folder = platform::Env().files->FromNative(FullPath(name + "-help"));
    }
    if (!actions_.PrepareProject(request_))
        throw Stop{{}, kFailed};
}

void Generation::CheckTarget() {
    auto& files = *platform::Env().files;
    const fs::path folder = files.ToNative(Parameters().FolderForGeneratedHelp());
    std::error_code ignored;
    const bool stood = fs::exists(folder, ignored);
    const auto refuse = [&](const std::string& message) {
        // Only the folder that the check has made, and only when it is empty.
        if (!stood)
            fs::remove(folder, ignored);
        throw Stop{message, kFailed};
    };
    if (actions_.CheckIfGenerationPossible() != kSuccess)
        refuse({});
    if (!Parameters().CompileHTMLHelp)
        return;
    const std::string copied = platform::FolderOf(CTovimarCompiler().GetCopiedHelpFullPath());
    if (!arguments_.copyTo.empty() && !CreateFolderPath(copied))
        refuse("the folder '" + files.ToNative(copied) + "' of --copy-to can't be made");
    if (!TestFolderWritable(copied))
        refuse("no write access to '" + files.ToNative(copied) +
               "', where the copy of the compiled help goes\n--copy-to names another folder, --no-compile "
               "makes none.");
}

/// Ids go into copies unless the originals were asked for: nobody's sources change by an option of a project.
void Generation::KeepSourceChanges() {
    if (!Parameters().SaveApplicationChanges)
        return;
    const auto target =
        arguments_.writeBack ? SourceChanges::Target::Originals : SourceChanges::Target::Copies;
    changes_.emplace(target, platform::FolderOf(Session::Context().CurrentSourceProjectFullPath()),
                     Parameters().FolderForGeneratedHelp() + "application");
    changes_->Attach(source_);
}

int Generation::Write() {
    StopIfInterrupted();
    KeepSourceChanges();
    surroundings_.Progress().Phase("Writing help to " +
                                   platform::Env().files->ToNative(Parameters().FolderForGeneratedHelp()));
    const auto outcome = actions_.GenerateFromOptions();
    surroundings_.Progress().Clear();
    return Judge(outcome);
}

int Generation::Judge(CTovimarActions::Outcome outcome) {
    if (outcome != CTovimarActions::Outcome::Cancelled)
        StopIfInterrupted();
    else if (platform::InterruptRequested())
        return kInterrupted;
    if (outcome != CTovimarActions::Outcome::Completed)
        return kFailed;
    const auto& generator = *Session::Generator();
    const bool compiled = platform::Env().files->FileExists(Parameters().CompiledHelpFullPath());
    const bool compilerFailed =
        Parameters().CompileHTMLHelp && (!compiled || generator.CompilerExitCode != 0);
    if (compilerFailed)
        PrintError((compiled ? "the help compiler had complaints:\n" : "the help compiler made no file:\n") +
                   generator.CompilerOutput);
    else if (arguments_.verbose && !generator.CompilerOutput.empty())
        PrintHint(generator.CompilerOutput);
    ShowResult();
    const int errors = surroundings_.Boxes().errors;
    if (errors > 0)
        PrintError(std::to_string(errors) + (errors == 1 ? " error" : " errors") +
                   " while the help was written");
    return compilerFailed || errors != 0 || Session::Run().runErrorCount != 0 ? kFailed : kDone;
}

void Generation::ShowResult() const {
    const std::string compiled = Parameters().CompiledHelpFullPath();
    const std::string copied = CTovimarCompiler().GetCopiedHelpFullPath();
    if (Parameters().CompileHTMLHelp) {
        ShowFile("Compiled help: ", compiled);
        if (!text::EqualsIgnoringCase(compiled, copied))
            ShowFile("Copied to:     ", copied);
    }
    ShowSourceChanges();
    ShowFile("Web help:      ", Parameters().FolderForGeneratedHelp() + "main.htm");
    ShowFile("Project:       ", Session::CurrentProject()->TvpFullPath());
}

void Generation::ShowSourceChanges() const {
    if (!changes_)
        return;
    if (const auto count = changes_->Written(); count > 0) {
        const std::string objects = std::to_string(count) + (count == 1 ? " export" : " exports");
        if (arguments_.writeBack)
            PrintResult("Context ids:   " + objects + " changed, the old texts beside them as .bak");
        else
            PrintResult("Context ids:   " + objects + " to change, as copies in " +
                        platform::Env().files->ToNative(changes_->CopiesFolder()));
    }
    if (const auto& failures = changes_->Failures(); !failures.empty())
        ShowMessage("Context ids could not be written into " + std::to_string(failures.size()) +
                        (failures.size() == 1 ? " export, " : " exports, the first of them: ") +
                        failures.front(),
                    kMsgCritical, kApplicationTitle);
    std::error_code ignored;
    if (!changes_->NotWritten().empty() || !fs::is_directory(arguments_.source, ignored))
        PrintWarning("context ids can't be written into a database file; '" +
                     platform::Env().files->ToNative(Parameters().FolderForGeneratedHelp() +
                                                     Parameters().HelpProjectName() + ".h") +
                     "' lists them");
}

} // namespace

int Generate(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Generation(arguments, surroundings).Run(); });
}

} // namespace tovimar::cli
