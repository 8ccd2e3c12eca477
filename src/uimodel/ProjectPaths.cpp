#include "uimodel/ProjectPaths.h"

#include "foundation/CAddInProject.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/files/Paths.h"
#include "platform/xml/XmlDocument.h"

namespace tovimar {

namespace {

std::string ReadPath(const XmlAttributes& node, const char* fullPath, const char* fileName,
                     ProjectFolder folder, CAddInProject* project) {
    std::string path = node.attribute(fullPath);
    if (!path.empty())
        return path;
    path = node.attribute(fileName);
    return path.empty() ? path : FolderOfProject(folder, project) + path;
}

} // namespace

std::string FolderOfProject(ProjectFolder folder, CAddInProject* project) {
    if (project == nullptr)
        project = Session::CurrentProject();
    if (project == nullptr)
        return {};
    return platform::WithTrailingBackslash(folder == ProjectFolder::Help ? project->Folder
                                                                         : project->PicsSubfolderPath());
}

std::string CompletedPath(const std::string& stored) {
    return platform::FolderOf(stored).empty() ? FolderOfProject(ProjectFolder::Help, nullptr) + stored
                                              : stored;
}

std::string LocalPicturePath(const std::string& picFullPath) {
    const CTovimarParameters* parameters = Session::Parameters();
    const std::string folder =
        parameters == nullptr ? "images\\" : parameters->NameOfFolderForGeneratedImagesWithSlash();
    return folder + platform::FileNameOf(picFullPath);
}

std::string ReadPicturePath(const XmlAttributes& node, CAddInProject* project) {
    return ReadPath(node, "PicFullPath", "PicFileName", ProjectFolder::Pictures, project);
}

std::string ReadTopicPath(const XmlAttributes& node, CAddInProject* project) {
    return ReadPath(node, "HtmlFullPath", "HtmlFileName", ProjectFolder::Help, project);
}

} // namespace tovimar
