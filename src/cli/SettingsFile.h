#pragma once

#include <map>
#include <string>

namespace tovimar::cli {

/// The options of a settings file or of a project file, read and changed one by one: whatever else stands in
/// the file stays as it is, byte for byte. Raises RaisedError with the path when the file can't be read or
/// written, or has no options.
class SettingsFile {
public:
    /// A Windows path.
    explicit SettingsFile(std::string path);

    /// Empty for an option that the file doesn't have. Names are exact.
    std::string Value(const std::string& name) const;
    /// Adds an option that the file doesn't have. Written and read back at once.
    void SetValue(const std::string& name, const std::string& value);

private:
    void Parse();

    std::string path_;
    std::string text_;
    std::map<std::string, std::string> values_;
};

} // namespace tovimar::cli
