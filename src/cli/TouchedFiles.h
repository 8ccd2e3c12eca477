#pragma once

#include <map>
#include <optional>
#include <string>

namespace tovimar::cli {

/// Files as they were before steps that are good together or not at all. What was remembered is put back at
/// the end, unless it is to stay as it has become.
class TouchedFiles {
public:
    TouchedFiles() = default;
    ~TouchedFiles();
    TouchedFiles(const TouchedFiles&) = delete;
    TouchedFiles& operator=(const TouchedFiles&) = delete;

    /// Before the file changes, comes or goes; the first time counts. An empty path does nothing.
    void Remember(const std::string& path);
    void Keep() { before_.clear(); }

private:
    /// Null for a file that wasn't there.
    std::map<std::string, std::optional<std::string>> before_;
};

} // namespace tovimar::cli
