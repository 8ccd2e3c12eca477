#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/ContextIdTarget.h"
#include "cli/HelpFiles.h"
#include "cli/PreparedRun.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/Session.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/Interrupt.h"

namespace tovimar::cli {
namespace {

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
    int Write();
    int Judge(CTovimarActions::Outcome outcome);
    CTovimarParameters& Parameters() const { return run_.Parameters(); }

    const Arguments& arguments_;
    Surroundings& surroundings_;
    // Outlives the run, which holds its source.
    ContextIdTarget contextIds_;
    PreparedRun run_;
};

int Generation::Write() {
    StopIfInterrupted();
    contextIds_.Attach(arguments_, run_.Source(), SourceChanges::Earlier::Remove);
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
    contextIds_.Tell(arguments_, run_.SourcePath());
    ShowWebHelpAndProject();
    const int errors = surroundings_.Boxes().errors;
    if (errors > 0)
        PrintError(std::to_string(errors) + (errors == 1 ? " error" : " errors") +
                   " while the help was written");
    return !compiled || errors != 0 || Session::Run().runErrorCount != 0 ? kFailed : kDone;
}

} // namespace

int Generate(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Generation(arguments, surroundings).Run(); });
}

} // namespace tovimar::cli
