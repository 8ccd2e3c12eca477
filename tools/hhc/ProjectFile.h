#pragma once

#include <filesystem>
#include <string>
#include <vector>

/// A help project file as the compiler `chmcmd` needs it. Projects come with backslashes, in the code page of
/// their language and with names in any case; `chmcmd` wants names exactly as they stand on the disk, and
/// breaks off over a file that is missing.
namespace hhc {

struct TranslatedProject {
    std::string text;                   ///< the project with every file name as it is on the disk
    std::filesystem::path compiledFile; ///< full path of the result
    std::vector<std::string> missing;   ///< files of the project that aren't there, left out
    bool hasFiles = false;              ///< at least one file of the list stands
};

/// `bytes` is the project file at `path`, which must be absolute.
TranslatedProject Translate(const std::filesystem::path& path, const std::string& bytes);

} // namespace hhc
