#pragma once

#include "generation/CTovimarActions.h"
#include "host/server/CTovimarClient.h"
#include "platform/AutomationObject.h"

#include <string>

namespace tovimar {
class CTovimarParameters;
}

namespace tovimar::cli {

struct Arguments;
class Surroundings;

/// An application read and connected, the options taken, and a help project for it made ready in its folder:
/// what comes before a run. The steps in order; each raises `Stop` when the run can't be.
class PreparedRun {
public:
    PreparedRun(const Arguments& arguments, Surroundings& surroundings)
        : arguments_(arguments), surroundings_(surroundings) {}

    /// Everything is read once before the first folder is made, so that bad input leaves nothing
    /// half-written.
    void ReadSource();
    void Connect();
    void TakeOptions();
    /// Makes the project the current one. `refuseEarlier`: the folder must not have it yet.
    void Prepare(bool refuseEarlier);
    /// Folder, name, help file and the place of the copy. Makes the folder.
    void CheckTarget();

    HostObject& Source() { return source_; }
    /// Native path of the application.
    const std::string& SourcePath() const { return sourcePath_; }
    CTovimarActions& Actions() { return actions_; }
    CTovimarParameters& Parameters() const;

private:
    void FindSource();
    void TakeProjectsOptions();
    void TakeOption(const std::string& name, const std::string& value);
    void RefuseEarlierProject() const;

    const Arguments& arguments_;
    Surroundings& surroundings_;
    std::string sourcePath_;
    std::string projectFile_; ///< Windows path of a project that is made anew; empty without one
    HostObject source_;
    CTovimarClient client_;
    CTovimarActions actions_;
    GenerationRequest request_;
};

} // namespace tovimar::cli
