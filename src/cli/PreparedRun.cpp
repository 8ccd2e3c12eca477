#include "cli/PreparedRun.h"

#include "cli/Console.h"
#include "cli/HelpFiles.h"
#include "cli/ProjectFile.h"
#include "cli/ProjectSource.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/Session.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimar.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/access/AccessApplication.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <filesystem>

namespace tovimar::cli {

namespace fs = std::filesystem;

CTovimarParameters& PreparedRun::Parameters() const {
    return *Session::Parameters();
}

/// A project file stands for the application that it was made from.
void PreparedRun::FindSource() {
    if (!text::EndsWithIgnoringCase(arguments_.source, ".tvp")) {
        sourcePath_ = arguments_.source;
        surroundings_.Progress().Phase("Reading " + sourcePath_);
        source_ = platform::access::OpenAccessApplication(sourcePath_);
        return;
    }
    projectFile_ = FindProjectFile(arguments_.source);
    const std::string remembered = RememberedSource(projectFile_);
    sourcePath_ = NativeSource(remembered);
    surroundings_.Progress().Phase("Reading " + sourcePath_);
    source_ = OpenRemembered(remembered);
}

void PreparedRun::ReadSource() {
    FindSource();
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
                   " objects of '" + FullPath(sourcePath_) + "' can't be read; nothing was written"};
    for (const std::string& note : application.notes)
        PrintWarning(note);
}

void PreparedRun::Connect() {
    RegisterSettingsLoader();
    if (client_.Connect(source_) != kSuccess)
        throw Stop{"'" + FullPath(sourcePath_) + "' can't be opened"};
    auto& generator = RunData().Generator();
    generator.NodeStarted = [this](const NodeProgress& node) {
        surroundings_.Progress().Object(node.kind, node.name, node.position, node.maximum);
    };
    generator.CompilerStarted = [this] { surroundings_.Progress().Phase("Compiling help"); };
    RunData().LoadSettings();
    StopIfInterrupted();
}

/// A project that is made anew keeps its folder, its name and its options.
void PreparedRun::TakeProjectsOptions() {
    if (projectFile_.empty())
        return;
    if (RunData().ReLoadSettings(projectFile_, /*vfLoadSettingsFromTvpFile=*/true) != kSuccess)
        throw Stop{"the options of '" + projectFile_ + "' can't be read"};
    auto& settings = *Session::Settings();
    request_.projectName = platform::BaseNameOf(projectFile_);
    request_.title = settings.OptionValue("HelpProjectTitle").AsString();
    request_.application = settings.OptionValue("Application").AsString();
    request_.folder = platform::FolderOf(projectFile_);
}

void PreparedRun::TakeOptions() {
    TakeProjectsOptions();
    for (const auto& [name, value] : arguments_.options)
        TakeOption(name, value);
    CAddInSettings().Load(*Session::Settings(), /*vfLoadFromProjectFile=*/false);
    if (!arguments_.compile)
        Parameters().CompileHTMLHelp = false;
    if (arguments_.writeBack)
        Parameters().SaveApplicationChanges = true;
    if (!arguments_.output.empty())
        request_.folder = platform::Env().files->FromNative(FullPath(arguments_.output));
    if (!arguments_.copyTo.empty())
        Parameters().FolderForCopiedHelp = platform::Env().files->FromNative(FullPath(arguments_.copyTo));
}

void PreparedRun::TakeOption(const std::string& name, const std::string& value) {
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

void PreparedRun::Prepare(bool refuseEarlier) {
    if (request_.projectName.empty() && request_.folder.empty())
        request_.folder = platform::Env().files->FromNative(
            FullPath(platform::BaseNameOf(Session::Context().CurrentSourceProjectFullPath()) + "-help"));
    if (request_.folder.empty())
        request_.folder = platform::Env().files->FromNative(FullPath(request_.projectName + "-help"));
    if (refuseEarlier)
        RefuseEarlierProject();
    if (!actions_.PrepareProject(request_))
        throw Stop{{}, kFailed};
}

/// A new project would lose what is in the earlier one.
void PreparedRun::RefuseEarlierProject() const {
    auto& files = *platform::Env().files;
    if (!files.FolderExists(request_.folder))
        return;
    const auto found = files.ListFiles(request_.folder, "*.tvp");
    if (!found.empty())
        throw Stop{"'" + request_.folder + "' already has the help project '" + found.front() +
                   "'\n\"tovimar generate\" goes on with it; --output names another folder."};
}

void PreparedRun::CheckTarget() {
    const fs::path folder = platform::Env().files->ToNative(Parameters().FolderForGeneratedHelp());
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
    if (const std::string complaint = CopyComplaint(arguments_); !complaint.empty())
        refuse(complaint);
}

} // namespace tovimar::cli
