#include "host/sources/CHelpPrjSourceProject.h"

#include "host/sources/CHelpPrjSourceItem.h"
#include "host/sources/CSourceProjectAspNet.h"
#include "host/sources/CSourceProjectCPP.h"
#include "host/sources/CSourceProjectCS.h"
#include "host/sources/CSourceProjectJS.h"
#include "host/sources/CSourceProjectMSAccess.h"
#include "host/sources/CSourceProjectMSExcel.h"
#include "host/sources/CSourceProjectVB6.h"
#include "host/sources/CSourceProjectVBNet.h"

#include <array>

namespace tovimar {
namespace {

const SourceItems kNoItems;
const KeyedList<std::unique_ptr<IHelpPrjSourceProject>> kNoProjects;

template <typename Project> std::unique_ptr<IHelpPrjSourceProject> Make() {
    return std::make_unique<Project>();
}

/// In the order in which they are tried.
constexpr std::array kMakers{Make<CSourceProjectAspNet>, Make<CSourceProjectMSAccess>,
                             Make<CSourceProjectVB6>,    Make<CSourceProjectVBNet>,
                             Make<CSourceProjectCS>,     Make<CSourceProjectJS>,
                             Make<CSourceProjectCPP>,    Make<CSourceProjectMSExcel>};

} // namespace

CHelpPrjSourceProject::CHelpPrjSourceProject() = default;
CHelpPrjSourceProject::~CHelpPrjSourceProject() = default;

ResultCode CHelpPrjSourceProject::Init(const std::string& vstrHostAppTypeName,
                                       const std::string& vstrProjectFileFullPath) {
    project_.reset();
    for (const auto make : kMakers) {
        auto project = make();
        if (project->Init(vstrHostAppTypeName, vstrProjectFileFullPath) != kSuccess)
            continue;
        project_ = std::move(project);
        return kSuccess;
    }
    return kFailure1;
}

void CHelpPrjSourceProject::Terminate() {
    if (project_)
        project_->Terminate();
}

bool CHelpPrjSourceProject::IsValid() const {
    return project_ && project_->IsValid();
}
std::string CHelpPrjSourceProject::ProjectType() const {
    return project_ ? project_->ProjectType() : std::string();
}
const SourceItems& CHelpPrjSourceProject::Forms() const {
    return project_ ? project_->Forms() : kNoItems;
}
bool CHelpPrjSourceProject::CouldHaveReports() const {
    return project_ && project_->CouldHaveReports();
}
const SourceItems& CHelpPrjSourceProject::Reports() const {
    return project_ ? project_->Reports() : kNoItems;
}
bool CHelpPrjSourceProject::CouldHaveTables() const {
    return project_ && project_->CouldHaveTables();
}
const SourceItems& CHelpPrjSourceProject::Tables() const {
    return project_ ? project_->Tables() : kNoItems;
}
bool CHelpPrjSourceProject::CouldHaveQueries() const {
    return project_ && project_->CouldHaveQueries();
}
const SourceItems& CHelpPrjSourceProject::Queries() const {
    return project_ ? project_->Queries() : kNoItems;
}
bool CHelpPrjSourceProject::CouldHaveMacros() const {
    return project_ && project_->CouldHaveMacros();
}
const SourceItems& CHelpPrjSourceProject::Macros() const {
    return project_ ? project_->Macros() : kNoItems;
}
std::string CHelpPrjSourceProject::Name() const {
    return project_ ? project_->Name() : std::string();
}
bool CHelpPrjSourceProject::IsProjectGroup() const {
    return project_ && project_->IsProjectGroup();
}
const KeyedList<std::unique_ptr<IHelpPrjSourceProject>>& CHelpPrjSourceProject::projects() const {
    return project_ ? project_->projects() : kNoProjects;
}
const SourceItems& CHelpPrjSourceProject::Worksheets() const {
    return project_ ? project_->Worksheets() : kNoItems;
}
const SourceItems& CHelpPrjSourceProject::Charts() const {
    return project_ ? project_->Charts() : kNoItems;
}

} // namespace tovimar
