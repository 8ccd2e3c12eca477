#pragma once

#include "helpcompiler/HelpDescription.h"
#include "helpcompiler/Message.h"
#include "helpcompiler/ProjectFolder.h"

#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace tovimar::helpcompiler {

/// A help project file (`.hhp`): options, files, and the numbers by which an application asks for a page.
struct HelpProject {
    /// What the project says of the help; pages, contents and index are empty yet.
    HelpDescription help;
    std::vector<std::string> files; ///< as named, UTF-8
    std::string contentsFile;       ///< as named, UTF-8; empty without one
    std::string indexFile;
    std::string compiledFile; ///< UTF-8, with slashes
    std::string stopListFile;
    std::unordered_map<std::string, int> lines; ///< on which a file is named, by its name as above

    int LineOf(const std::string& file) const {
        const auto line = lines.find(file);
        return line == lines.end() ? 0 : line->second;
    }
};

/// The project's text is UTF-8, or of the code page of its language. Files that it includes are read from
/// `folder`, a missing one is a complaint. `name` is that of the project file.
HelpProject ReadHelpProject(std::string_view bytes, const std::string& name, ProjectFolder& folder,
                            const Tell& tell);

} // namespace tovimar::helpcompiler
