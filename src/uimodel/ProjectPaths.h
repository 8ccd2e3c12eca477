#pragma once

#include <string>
#include <string_view>

namespace tovimar {

class CAddInProject;
class XmlAttributes;
class XmlNode;

/// Where the files that a definition names lie. Definitions keep file names; the project at hand, or else
/// the current one, knows the folders.
enum class ProjectFolder { Help, Pictures };

/// The folder, with a trailing backslash; empty without a project.
std::string FolderOfProject(ProjectFolder folder, CAddInProject* project);
/// A path that has a folder part stays; a bare name goes behind the current project's help folder.
std::string CompletedPath(const std::string& stored);
/// Path relative to a topic: the images folder's name and the file's.
std::string LocalPicturePath(const std::string& picFullPath);
/// `PicFullPath` of an element, else `PicFileName` in the project's folder of pictures.
std::string ReadPicturePath(const XmlAttributes& node, CAddInProject* project);
/// `HtmlFullPath` of an element, else `HtmlFileName` in the project's folder.
std::string ReadTopicPath(const XmlAttributes& node, CAddInProject* project);

} // namespace tovimar
