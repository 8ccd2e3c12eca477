#pragma once

#include "foundation/CAddInProject.h"
#include "platform/Error.h"
#include "platform/KeyedList.h"

#include <memory>
#include <set>
#include <string>
#include <vector>

namespace tovimar {

class XmlNode;

/// The user's catalogue of help projects, keyed by the path of their project files, and the current project.
/// Reads its file at the first use. A broken file is repaired from its ".bak".
class CAddInProjects {
public:
    /// Reads the catalogue, making an empty one when there is none. Entries whose project file is missing or
    /// doesn't parse are left out. 0, or the number of the failure, which is reported.
    ResultCode Init(const std::string& vstrProjectsDefFullPath);
    /// Empty when no project of that source is listed.
    std::string ExistingSUIDForGivenSourceProject(const std::string& vstrSourceProjectFullPath);
    /// Lists the project and gives it the identifiers that it lacks; the listed one when its path is taken.
    CAddInProject& Add(std::unique_ptr<CAddInProject> robj);
    /// By the path of the project file, as the list is keyed; null for a miss.
    CAddInProject* ProjectExists(const std::string& vstrProjectName);
    bool IsSavedProject(const std::string& vstrProjectName);
    CAddInProject* Project(const std::string& vstrProjectName);
    /// Writes the catalogue, and the tree first when a path for it is given. What other processes listed or
    /// forgot since it was read is taken over. 0, or the failure, which is reported; the old files stand
    /// then.
    ResultCode Save(const std::string& vstrProjectTreeFullPathToSave = {});
    /// A listed project or null; not owned.
    void SetCurrentProject(CAddInProject* robjProject);
    /// Makes a project current that isn't listed yet; the catalogue owns it. `ListCurrentProject` adds it.
    CAddInProject& SetCurrentProject(std::unique_ptr<CAddInProject> project);
    CAddInProject* CurrentProject() const { return current_; }
    /// Lists the current project when it is not yet; it stays current. Null without one.
    CAddInProject* ListCurrentProject();
    /// Saves with the current project's own file when the path is empty.
    ResultCode SaveCurrentProject(const std::string& vstrFullPath2Save = {});
    /// The name itself when no saved project has it, else with the first free number from 1 to 255.
    /// Raises 0x80040001 when none is free.
    std::string GetUniqueProjectName(const std::string& vstrSourceProjectName);
    bool ChangeCurrentProjectName(const std::string& vstrNewName);
    /// Takes a project out of the list, by the path of its project file; its files stay, and `Save` writes
    /// the list. False when it isn't listed.
    bool Forget(const std::string& vstrTVPFullPath);
    /// Drops every project that was never saved.
    void RemoveTempProjects();
    std::int32_t Count();
    /// Paths of the project files of the source project at hand, the latest first.
    std::vector<std::string> CurrentSourceProjectTvpProjects();
    CAddInProject* GetProjectDefinitionByTvpFullPath(const std::string& vstrTVPFullPath);

private:
    using List = KeyedList<std::unique_ptr<CAddInProject>>;

    List& Projects();
    void ReadCatalogue();
    void ReadProject(const XmlNode& element);
    ResultCode SaveTree(const std::string& path);
    ResultCode SaveCatalogue();
    void TakeOverChanges();
    void NoteListed(const XmlNode& projects);
    ResultCode WriteCatalogue(const std::string& text);
    void Remove(std::size_t position);

    List list_;
    CAddInProject* current_ = nullptr;
    std::unique_ptr<CAddInProject> unlistedCurrent_;
    std::string path_;
    /// Folded paths of the project files in the catalogue's file, as this process last read or wrote it.
    std::set<std::string> listed_;
    bool loaded_ = false;
    bool loading_ = false;
};

} // namespace tovimar
