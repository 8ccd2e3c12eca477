#include "cli/Viewer.h"

#include "cli/Console.h"
#include "foundation/ShowMessage.h"

#include <cstdlib>

namespace tovimar::cli {
namespace {

class Showing : public platform::Processes {
public:
    explicit Showing(std::unique_ptr<platform::Processes> real) : real_(std::move(real)) {}

    Outcome RunAndWait(const std::string& commandLine) override { return real_->RunAndWait(commandLine); }

    bool Open(const std::string& pathOrAddress) override {
        const char* viewer = std::getenv("TOVIMAR_VIEWER");
        const bool named = viewer != nullptr && *viewer != '\0';
        if (named ? OpenWith(viewer, pathOrAddress) : real_->Open(pathOrAddress))
            return true;
        PrintHint(named ? "To be opened by hand:"
                        : "No program shows it here; TOVIMAR_VIEWER may name one. To be opened by hand:");
        PrintResult(NativePathsInText(pathOrAddress));
        return false;
    }

private:
    bool OpenWith(const std::string& viewer, const std::string& path) {
        try {
            const Outcome outcome = real_->RunAndWait(viewer + " \"" + path + "\"");
            if (outcome.exitCode == 0)
                return true;
            PrintWarning("'" + viewer + "' ended with the code " + std::to_string(outcome.exitCode) + "\n" +
                         outcome.output);
        } catch (const RaisedError& failure) {
            PrintWarning(failure.what());
        }
        return false;
    }

    std::unique_ptr<platform::Processes> real_;
};

class ShowingViewer : public platform::HelpViewer {
public:
    std::int32_t Show(std::int32_t, const std::string& helpFile, std::uint32_t, const std::string&) override {
        platform::Env().processes->Open(helpFile);
        return 0;
    }
};

} // namespace

std::unique_ptr<platform::Processes> ShowingProcesses(std::unique_ptr<platform::Processes> real) {
    return std::make_unique<Showing>(std::move(real));
}

std::unique_ptr<platform::HelpViewer> ShowingHelpViewer() {
    return std::make_unique<ShowingViewer>();
}

} // namespace tovimar::cli
