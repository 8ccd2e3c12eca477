#include "cli/ContextIdTarget.h"

#include "cli/CommandLine.h"
#include "cli/Console.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"

#include <filesystem>

namespace tovimar::cli {

void ContextIdTarget::Attach(const Arguments& arguments, const HostObject& application,
                             SourceChanges::Earlier earlier) {
    const auto& parameters = *Session::Parameters();
    if (!parameters.SaveApplicationChanges)
        return;
    const auto target =
        arguments.writeBack ? SourceChanges::Target::Originals : SourceChanges::Target::Copies;
    changes_.emplace(target, platform::FolderOf(Session::Context().CurrentSourceProjectFullPath()),
                     parameters.FolderForGeneratedHelp() + "application");
    changes_->Attach(application, earlier);
}

void ContextIdTarget::Tell(const Arguments& arguments, const std::string& source) const {
    if (!changes_)
        return;
    if (const auto count = changes_->Written(); count > 0) {
        const std::string objects = std::to_string(count) + (count == 1 ? " export" : " exports");
        if (arguments.writeBack)
            PrintResult("Context ids:   " + objects + " changed, the old texts beside them as .bak");
        else
            PrintResult("Context ids:   " + objects + " to change, as copies in " +
                        platform::Env().files->ToNative(changes_->CopiesFolder()));
    }
    TellUnwritten(source);
}

void ContextIdTarget::TellUnwritten(const std::string& source) const {
    if (const auto& failures = changes_->Failures(); !failures.empty())
        ShowMessage("Context ids could not be written into " + std::to_string(failures.size()) +
                        (failures.size() == 1 ? " export, " : " exports, the first of them: ") +
                        failures.front(),
                    kMsgCritical, kApplicationTitle);
    std::error_code ignored;
    const auto& parameters = *Session::Parameters();
    if (!changes_->NotWritten().empty() || !std::filesystem::is_directory(source, ignored))
        PrintWarning("context ids can't be written into a database file; '" +
                     platform::Env().files->ToNative(parameters.FolderForGeneratedHelp() +
                                                     parameters.HelpProjectName() + ".h") +
                     "' lists them");
}

} // namespace tovimar::cli
