#include "foundation/CAddInProjects.h"

#include "foundation/CXMLFile.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"

namespace tovimar {

CAddInProjects::List& CAddInProjects::Projects() {
    if (!loaded_ && !loading_)
        Init(CataloguePath());
    return list_;
}

std::string CAddInProjects::ExistingSUIDForGivenSourceProject(const std::string& vstrSourceProjectFullPath) {
    for (const auto& project : Projects())
        if (text::EqualsIgnoringCase(project->SourceProjectFullPath, vstrSourceProjectFullPath))
            return project->SUID;
    return {};
}

CAddInProject& CAddInProjects::Add(std::unique_ptr<CAddInProject> robj) {
    List& list = Projects();
    const std::string key = robj->TvpFullPath();
    if (auto* listed = list.Find(key))
        return **listed;
    auto& identifiers = *platform::Env().identifiers;
    if (robj->HUID.empty())
        robj->HUID = identifiers.NewGuid();
    if (robj->SUID.empty())
        robj->SUID = ExistingSUIDForGivenSourceProject(robj->SourceProjectFullPath);
    if (robj->SUID.empty())
        robj->SUID = identifiers.NewGuid();
    list.Add(std::move(robj), key);
    return *list.At(list.Count());
}

CAddInProject* CAddInProjects::GetProjectDefinitionByTvpFullPath(const std::string& vstrTVPFullPath) {
    const auto* found = Projects().Find(vstrTVPFullPath);
    return found != nullptr ? found->get() : nullptr;
}

CAddInProject* CAddInProjects::ProjectExists(const std::string& vstrProjectName) {
    return GetProjectDefinitionByTvpFullPath(vstrProjectName);
}

CAddInProject* CAddInProjects::Project(const std::string& vstrProjectName) {
    return GetProjectDefinitionByTvpFullPath(vstrProjectName);
}

bool CAddInProjects::IsSavedProject(const std::string& vstrProjectName) {
    for (const auto& project : Projects())
        if (!project->IsNew && text::EqualsIgnoringCase(project->Name, vstrProjectName))
            return true;
    return false;
}

std::string CAddInProjects::GetUniqueProjectName(const std::string& vstrSourceProjectName) {
    if (!IsSavedProject(vstrSourceProjectName))
        return vstrSourceProjectName;
    for (int i = 1; i <= 255; ++i) {
        const std::string name = vstrSourceProjectName + std::to_string(i);
        if (!IsSavedProject(name))
            return name;
    }
    throw RaisedError(kFailure1, "Unable to get unique project name for " + vstrSourceProjectName,
                      "CAddInProjects.GetUniqueProjectName");
}

void CAddInProjects::SetCurrentProject(CAddInProject* robjProject) {
    if (robjProject != unlistedCurrent_.get())
        unlistedCurrent_.reset();
    current_ = robjProject;
}

CAddInProject& CAddInProjects::SetCurrentProject(std::unique_ptr<CAddInProject> project) {
    unlistedCurrent_ = std::move(project);
    current_ = unlistedCurrent_.get();
    return *current_;
}

CAddInProject* CAddInProjects::ListCurrentProject() {
    if (unlistedCurrent_)
        current_ = &Add(std::move(unlistedCurrent_));
    return current_;
}

bool CAddInProjects::ChangeCurrentProjectName(const std::string& vstrNewName) {
    if (current_ != nullptr)
        current_->Name = vstrNewName;
    return true;
}

void CAddInProjects::Remove(std::size_t position) {
    List& list = Projects();
    if (list.At(position).get() == current_)
        current_ = nullptr;
    list.TakeAt(position);
}

bool CAddInProjects::Forget(const std::string& vstrTVPFullPath) {
    const std::size_t position = Projects().PositionOf(vstrTVPFullPath);
    if (position > 0)
        Remove(position);
    return position > 0;
}

void CAddInProjects::RemoveTempProjects() {
    for (std::size_t i = Projects().Count(); i > 0; --i)
        if (list_.At(i)->IsNew)
            Remove(i);
}

std::int32_t CAddInProjects::Count() {
    return static_cast<std::int32_t>(Projects().Count());
}

std::vector<std::string> CAddInProjects::CurrentSourceProjectTvpProjects() {
    std::vector<std::string> paths;
    const std::string source = Session::Context().CurrentSourceProjectFullPath();
    if (source.empty())
        return paths;
    auto& files = *platform::Env().files;
    for (std::size_t i = Projects().Count(); i > 0; --i) {
        const CAddInProject& project = *list_.At(i);
        const std::string path = project.TvpFullPath();
        if (!files.FileExists(path))
            Remove(i);
        else if (text::EqualsIgnoringCase(project.SourceProjectFullPath, source))
            paths.push_back(path);
    }
    return paths;
}

} // namespace tovimar
