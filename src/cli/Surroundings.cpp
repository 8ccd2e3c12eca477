#include "cli/Surroundings.h"

#include "cli/CommandLine.h"
#include "cli/Question.h"
#include "cli/Viewer.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "platform/Interrupt.h"
#include "platform/text/Text.h"

#include <cstdlib>
#include <filesystem>
#include <map>
#include <unistd.h>
#include <vector>

namespace tovimar::cli {
namespace {

namespace fs = std::filesystem;

constexpr const char* kInstallKey = "HKEY_LOCAL_MACHINE\\SOFTWARE\\Tovimar\\Microsoft Access";
constexpr const char* kCompilerKey =
    "HKEY_LOCAL_MACHINE\\SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\App Paths\\hhw.exe";

/// What an installer would have written, below what the user's registry says.
class InstalledRegistry : public platform::Registry {
public:
    explicit InstalledRegistry(std::unique_ptr<platform::Registry> own) : own_(std::move(own)) {}

    void Install(const std::string& key, const std::string& valueName, const std::string& text) {
        installed_[text::FoldCase(key + "\n" + valueName)] = text;
    }
    std::string Read(const std::string& key, const std::string& valueName) override {
        if (std::string text = own_->Read(key, valueName); !text.empty())
            return text;
        const auto found = installed_.find(text::FoldCase(key + "\n" + valueName));
        return found == installed_.end() ? std::string() : found->second;
    }
    void Write(const std::string& key, const std::string& valueName, const std::string& text) override {
        own_->Write(key, valueName, text);
    }

private:
    std::unique_ptr<platform::Registry> own_;
    std::map<std::string, std::string> installed_;
};

fs::path ProgramFolder() {
    std::error_code error;
    const fs::path program = fs::read_symlink("/proc/self/exe", error);
    return error ? fs::current_path() : program.parent_path();
}

bool IsInstallation(const fs::path& folder) {
    std::error_code ignored;
    return fs::exists(folder / "Settings", ignored) && fs::exists(folder / "Templates", ignored);
}

/// TOVIMAR_INSTALL, beside the program, in the prefix that it is installed in, in the source tree around a
/// build, then where packages put it. A named place counts whatever it holds, so that a wrong one is told.
fs::path FindInstallation(const fs::path& program) {
    if (const char* named = std::getenv("TOVIMAR_INSTALL"); named != nullptr && *named != '\0')
        return fs::absolute(named);
    for (const fs::path& folder : {program / "install", program / "../share/tovimar", program / "../install",
                                   program / "../../install", fs::path("/usr/share/tovimar")})
        if (IsInstallation(folder))
            return fs::weakly_canonical(folder);
    return {};
}

/// Folder of the help compiler; nothing when it isn't installed.
fs::path FindCompiler(const fs::path& program) {
    for (const fs::path& folder :
         {program / "tools", program / "../lib/tovimar", fs::path("/usr/lib/tovimar")})
        if (access((folder / "hhc.exe").c_str(), X_OK) == 0)
            return fs::weakly_canonical(folder);
    return {};
}

std::unique_ptr<platform::Environment> MakeEnvironment() {
    const fs::path program = ProgramFolder();
    platform::RealEnvironmentOptions options;
    options.programFolder = program.string();
    auto environment = platform::MakeRealEnvironment(options);
    auto registry = std::make_unique<InstalledRegistry>(std::move(environment->registry));
    if (const fs::path folder = FindInstallation(program); !folder.empty())
        registry->Install(kInstallKey, "InstallPath", environment->files->FromNative(folder.string()));
    if (const fs::path folder = FindCompiler(program); !folder.empty())
        registry->Install(kCompilerKey, {}, environment->files->FromNative((folder / "hhw.exe").string()));
    environment->registry = std::move(registry);
    environment->processes = ShowingProcesses(std::move(environment->processes));
    environment->helpViewer = ShowingHelpViewer();
    environment->doEvents = [] {
        if (platform::InterruptRequested())
            Session::Run().generationInterrupted = true;
    };
    return environment;
}

} // namespace

Surroundings::Surroundings(const Arguments& arguments)
    : progress_(arguments.verbose), asks_(HasTerminal() && !arguments.yes && !arguments.json) {
    platform::InstallInterruptHandler();
    auto environment = MakeEnvironment();
    auto boxes = std::make_unique<ConsoleMessageBoxes>(progress_, arguments.verbose, asks_);
    boxes_ = boxes.get();
    environment->messageBoxes = std::move(boxes);
    environment->progressWindow = std::make_unique<DetailView>(progress_);
    before_ = platform::SetEnvironment(std::move(environment));
}

Surroundings::~Surroundings() {
    platform::SetEnvironment(std::move(before_));
}

std::string Surroundings::MissingInstallation() const {
    auto& files = *platform::Env().files;
    const std::string settings = ShippedSettingsFile();
    const std::string templates = ParameterizedTemplatesFolder();
    for (const auto& [path, there] : {std::pair(settings, files.FileExists(settings)),
                                      std::pair(templates, files.FolderExists(templates))})
        if (!there)
            return "the installation is incomplete: '" + files.ToNative(path) +
                   "' is missing\nThe folder \"install\" belongs beside the program; TOVIMAR_INSTALL may "
                   "name it.";
    return {};
}

} // namespace tovimar::cli
