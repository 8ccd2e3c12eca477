#pragma once

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>
#include <unistd.h>

/// A folder of a test's own in which outside readers are run on what we wrote.
class Folder {
public:
    Folder() {
        std::string pattern = std::filesystem::temp_directory_path() / "helpcompilerXXXXXX";
        path_ = mkdtemp(pattern.data());
    }
    ~Folder() {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }
    Folder(const Folder&) = delete;
    Folder& operator=(const Folder&) = delete;

    const std::filesystem::path& Path() const { return path_; }
    void Write(const std::string& name, std::string_view bytes) const {
        std::filesystem::create_directories((path_ / name).parent_path());
        std::ofstream(path_ / name, std::ios::binary) << bytes;
    }
    std::string Read(const std::string& name) const {
        std::ifstream file(path_ / name, std::ios::binary);
        return {std::istreambuf_iterator<char>(file), {}};
    }
    /// What the command prints goes into the file "printed". False when it fails.
    bool Run(const std::string& command) const {
        const std::string line = "cd '" + path_.string() + "' && { " + command + "; } >printed 2>&1";
        return std::system(line.c_str()) == 0;
    }

private:
    std::filesystem::path path_;
};
