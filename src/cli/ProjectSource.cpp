#include "cli/ProjectSource.h"

#include "cli/ProjectFile.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Paths.h"
#include "generation/CAddInSettings.h"
#include "platform/Environment.h"
#include "platform/access/AccessApplication.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar::cli {

namespace {

[[noreturn]] void RefuseMissing(const std::string& source, const std::string& option) {
    throw Stop{"the application of the project isn't at '" + source + "' any more\n" + option +
               " names its place."};
}

/// How a command takes the place of the application.
const char* SourceOption(const Arguments& arguments) {
    return arguments.command == Arguments::Command::Regenerate ? "SOURCE, behind the project,"
                                                               : kSourceOption;
}

} // namespace

/// The catalogue knows what each project was made from.
std::string RememberedSource(const std::string& projectFile, const std::string& option) {
    CAddInProjects catalogue;
    catalogue.Init(CataloguePath());
    const auto* project = catalogue.GetProjectDefinitionByTvpFullPath(projectFile);
    if (project == nullptr || project->SourceProjectFullPath.empty())
        throw Stop{"it isn't known which application '" + projectFile + "' was made from\n" + option +
                   " names its exports or its database."};
    const std::string& source = project->SourceProjectFullPath;
    auto& files = *platform::Env().files;
    if (!files.FileExists(source) && !files.FolderExists(platform::FolderOf(source)))
        RefuseMissing(source, option);
    return source;
}

/// A folder of exports counts as a database of its name, which needn't be there; with one at hand the exports
/// beside it still belong to it.
HostObject OpenRemembered(const std::string& source, const std::string& option) {
    auto& files = *platform::Env().files;
    try {
        auto application =
            platform::access::OpenAccessApplication(files.ToNative(platform::FolderOf(source)));
        const std::string name = application->Get("CurrentProject").AsObject()->Get("FullName").AsString();
        if (text::EqualsIgnoringCase(name, source))
            return application;
    } catch (const RaisedError&) {
        if (!files.FileExists(source))
            throw;
    }
    if (!files.FileExists(source))
        RefuseMissing(source, option);
    return platform::access::OpenAccessApplication(files.ToNative(source));
}

ProjectSource::ProjectSource(const Arguments& arguments, Surroundings& surroundings)
    : arguments_(arguments), surroundings_(surroundings), projectFile_(FindProjectFile(arguments.project)) {}

HostObject ProjectSource::OpenApplication() {
    if (!arguments_.source.empty()) {
        source_ = arguments_.source;
        surroundings_.Progress().Phase("Reading " + source_);
        return platform::access::OpenAccessApplication(source_);
    }
    const std::string remembered = RememberedSource(projectFile_, SourceOption(arguments_));
    source_ = NativeSource(remembered);
    surroundings_.Progress().Phase("Reading " + source_);
    return OpenRemembered(remembered, SourceOption(arguments_));
}

void ProjectSource::Open() {
    application_ = OpenApplication();
    StopIfInterrupted();
    RegisterSettingsLoader();
    if (client_.Connect(application_) != kSuccess)
        throw Stop{"'" + source_ + "' can't be opened"};
    StopIfInterrupted();
}

} // namespace tovimar::cli
