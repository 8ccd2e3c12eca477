#include "cli/Commands.h"
#include "cli/HelpFiles.h"
#include "cli/PreparedRun.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/Session.h"
#include "platform/Interrupt.h"

namespace tovimar::cli {
namespace {

int Create(const Arguments& arguments, Surroundings& surroundings) {
    surroundings.Boxes().warningsStop = true;
    PreparedRun run(arguments, surroundings);
    run.ReadSource();
    run.Connect();
    run.TakeOptions();
    run.Prepare(/*refuseEarlier=*/true);
    run.CheckTarget();
    StopIfInterrupted();
    const auto outcome = run.Actions().CreateFromOptions();
    surroundings.Progress().Clear();
    StopIfInterrupted();
    if (outcome != CTovimarActions::Outcome::Completed || surroundings.Boxes().errors > 0 ||
        Session::Run().runErrorCount != 0)
        return kFailed;
    ShowWebHelpAndProject();
    return kDone;
}

} // namespace

int CreateProject(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Create(arguments, surroundings); });
}

} // namespace tovimar::cli
