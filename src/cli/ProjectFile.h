#pragma once

#include <optional>
#include <string>
#include <vector>

namespace tovimar::cli {

/// An entry of the catalogue as its file has it, whether or not its project is still there.
struct ListedProject {
    std::string name;
    std::string title;  ///< empty when the project can't be read
    std::string file;   ///< Windows path of the project file
    std::string source; ///< Windows path of the application
    bool missing = false;
};

/// In the order of the catalogue. What is wrong with its file is told.
std::vector<ListedProject> ListedProjects();
/// Windows path of the project file that was typed as a file, as a folder that holds one, or as a name of the
/// catalogue. Nothing typed means the working folder, or else the catalogue's only project. Raises `Stop`
/// with the candidates when there isn't one.
std::string FindProjectFile(const std::string& typed);
/// The catalogue's entry that a name or a path means, also one whose project is missing. Raises `Stop` when
/// there are several.
std::optional<ListedProject> FindListed(const std::string& typed);
/// Native path of the application that a project remembers: a folder of exports counts as a database of its
/// name, which needn't be there.
std::string NativeSource(const std::string& remembered);
/// Raises `Stop` when the file can't be read or is no help project.
void CheckProjectFile(const std::string& file);

} // namespace tovimar::cli
