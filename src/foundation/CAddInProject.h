#pragma once

#include <string>

namespace tovimar {

/// One help project: the source of every path of it.
class CAddInProject {
public:
    /// The source is a group of projects.
    bool HasSeveralSourceProjects = false;
    /// Names of the source projects, joined by "|"; asked of the host when empty, and kept.
    const std::string& SourceProjectsList();
    void SetSourceProjectsList(const std::string& list) { sourceProjectsList_ = list; }
    void RefreshSourceProjectsList();

    /// Unique among saved projects.
    std::string Name;
    /// Help title; reads as `Name` when empty.
    std::string Title() const { return title_.empty() ? Name : title_; }
    void SetTitle(const std::string& title) { title_ = title; }
    /// The project's file name without folder and extension.
    std::string FileName;
    /// Windows path; a trailing backslash makes no difference to the paths below.
    std::string Folder;
    std::string PicsSubfolderName;
    /// With a trailing backslash. Sets the name to "images" when that folder doesn't exist.
    std::string PicsSubfolderPath();
    std::string SourceProjectFullPath;

    /// Files of the project; empty while `FileName` is empty.
    std::string TvpFullPath() const { return FilePath(".tvp"); }
    std::string CHMFullPath() const { return FilePath(".chm"); }
    std::string HHPFullPath() const { return FilePath(".hhp"); }
    std::string HHKFullPath() const { return FilePath(".hhk"); }
    std::string HHCFullPath() const { return FilePath(".hhc"); }

    /// Identifier of this help project, and the one shared by all help projects of its source project.
    std::string HUID;
    std::string SUID;
    /// Not yet saved to the catalogue.
    bool IsNew = true;
    /// `xml\` below the folder: the definitions of the documented objects.
    std::string XmlFormsFolder() const;

private:
    std::string FilePath(const char* extension) const;

    std::string title_;
    std::string sourceProjectsList_;
};

} // namespace tovimar
