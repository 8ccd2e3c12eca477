#pragma once

#include "host/server/CTovimarClient.h"
#include "platform/AutomationObject.h"

#include <string>

namespace tovimar::cli {

/// What a refusal calls the argument that names the place of an application.
constexpr const char* kSourceOption = "--source";

struct Arguments;
class Surroundings;

/// Windows path of the application that the catalogue remembers for a project. Raises `Stop` when it doesn't
/// know it, or nothing is there any more.
std::string RememberedSource(const std::string& projectFile, const std::string& option = kSourceOption);
/// Raises `Stop` when it isn't there any more.
HostObject OpenRemembered(const std::string& source, const std::string& option = kSourceOption);

/// A help project and the application that it was made from, for the commands that work on a help that
/// exists. Raises `Stop` where one of the two can't be had.
class ProjectSource {
public:
    ProjectSource(const Arguments& arguments, Surroundings& surroundings);

    /// Windows path of the project file.
    const std::string& ProjectFile() const { return projectFile_; }
    /// Native path of the application; empty before `Open`.
    const std::string& Source() const { return source_; }
    /// Null before `Open`.
    const HostObject& Application() const { return application_; }
    /// Reads the application, the one of --source or the one that the catalogue remembers, and connects to
    /// it.
    void Open();

private:
    HostObject OpenApplication();

    const Arguments& arguments_;
    Surroundings& surroundings_;
    std::string projectFile_;
    std::string source_;
    HostObject application_;
    CTovimarClient client_;
};

} // namespace tovimar::cli
