#pragma once

#include <string>
#include <vector>

namespace tovimar {

class XmlNode;

/// A source file of a project of the newer format (root element `Project`), path as the project has it.
struct BuildProjectForm {
    std::string path;
    std::string subType;
    std::string buildAction; ///< "Compile" or "Content"
};

/// The forms and user controls in the order of the project, each once: a form that has a designer's file by
/// that one. Files of the kind "Content" come too, with an empty subtype.
std::vector<BuildProjectForm> BuildProjectForms(const XmlNode& project);

/// "Form" or "UserControl", in any case.
bool IsFormSubType(const std::string& subType);

} // namespace tovimar
