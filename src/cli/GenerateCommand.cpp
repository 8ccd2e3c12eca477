#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/HelpFiles.h"
#include "cli/PreparedRun.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "generation/SourceChanges.h"
#include "platform/Environment.h"
#include "platform/Interrupt.h"
#include "platform/files/Paths.h"

#include <filesystem>
#include <optional>

namespace tovimar::cli {
namespace {

namespace fs = std::filesystem;

/// One command run: the steps in order, each stops the run by raising.
class Generation {
public:
    Generation(const Arguments& arguments, Surroundings& surroundings)
        : arguments_(arguments), surroundings_(surroundings), run_(arguments, surroundings) {}

    int Run() {
        surroundings_.Boxes().warningsStop = true;
        run_.ReadSource();
        run_.Connect();
        run_.TakeOptions();
        CheckCompiler();
        run_.Prepare(/*refuseEarlier=*/false);
        run_.CheckTarget();
        surroundings_.Boxes().warningsStop = false;
        return Write();
    }

private:
    void KeepSourceChanges();
    int Write();
    int Judge(CTovimarActions::Outcome outcome);
    void ShowSourceChanges() const;
    CTovimarParameters& Parameters() const { return run_.Parameters(); }

    const Arguments& arguments_;
    Surroundings& surroundings_;
    // Outlives the run, which holds its source.
    std::optional<SourceChanges> changes_;
    PreparedRun run_;
};

/// Ids go into copies unless the originals were asked for: nobody's sources change by an option of a project.
void Generation::KeepSourceChanges() {
    if (!Parameters().SaveApplicationChanges)
        return;
    const auto target =
        arguments_.writeBack ? SourceChanges::Target::Originals : SourceChanges::Target::Copies;
    changes_.emplace(target, platform::FolderOf(Session::Context().CurrentSourceProjectFullPath()),
                     Parameters().FolderForGeneratedHelp() + "application");
    changes_->Attach(run_.Source());
}

int Generation::Write() {
    StopIfInterrupted();
    KeepSourceChanges();
    surroundings_.Progress().Phase("Writing help to " +
                                   platform::Env().files->ToNative(Parameters().FolderForGeneratedHelp()));
    const auto outcome = run_.Actions().GenerateFromOptions(/*checked=*/true);
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
    const bool compiled = CompilerSucceeded(arguments_.verbose);
    ShowCompiledHelp();
    ShowSourceChanges();
    ShowWebHelpAndProject();
    const int errors = surroundings_.Boxes().errors;
    if (errors > 0)
        PrintError(std::to_string(errors) + (errors == 1 ? " error" : " errors") +
                   " while the help was written");
    return !compiled || errors != 0 || Session::Run().runErrorCount != 0 ? kFailed : kDone;
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
    if (!changes_->NotWritten().empty() || !fs::is_directory(run_.SourcePath(), ignored))
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
