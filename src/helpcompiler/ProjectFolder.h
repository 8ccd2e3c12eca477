#pragma once

#include <filesystem>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>

namespace tovimar::helpcompiler {

/// The files of a help project. Projects and pages name them with slashes or backslashes and in any case;
/// every name given out is spelled as it stands on the disk, with slashes. Names are UTF-8.
class ProjectFolder {
public:
    explicit ProjectFolder(std::filesystem::path folder) : folder_(std::move(folder)) {}

    /// The name of an existing file; none when there is no such file.
    std::optional<std::string> Find(std::string_view name);
    std::filesystem::path PathOf(const std::string& name) const { return folder_ / name; }

private:
    using Names = std::unordered_map<std::string, std::string>; ///< by folded name

    const Names& NamesIn(const std::filesystem::path& folder);

    std::filesystem::path folder_;
    std::map<std::string, Names> listings_;
};

/// The file that a page's reference leads to, from the project's folder on; none for an address elsewhere, or
/// for a place of the page itself. `outside` tells of a file beyond the project's folder.
std::optional<std::string> FileOfReference(std::string_view page, std::string_view target, bool& outside);

/// A name with slashes in place of backslashes.
std::string WithSlashes(std::string_view name);

/// "htm" of "a/B.HTM"; empty without one.
std::string LowerExtension(std::string_view name);

} // namespace tovimar::helpcompiler
