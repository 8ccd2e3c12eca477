#pragma once

#include "platform/Environment.h"

#include <ctime>
#include <filesystem>
#include <unordered_map>

namespace tovimar::platform {

/// The files of the machine behind Windows paths: "Z:\" is the root, "C:\" a folder. Other drives and
/// network paths exist for nobody.
class DiskFileSystem : public FileSystem {
public:
    /// `driveC` is native and is made on the first write below it.
    explicit DiskFileSystem(std::string driveC);

    bool FileExists(const std::string& path) override;
    bool FolderExists(const std::string& path) override;
    std::string ReadFile(const std::string& path) override;
    void WriteFile(const std::string& path, std::string_view bytes) override;
    void WriteFileToDisk(const std::string& path, std::string_view bytes) override;
    void AppendFile(const std::string& path, std::string_view bytes) override;
    void OverwriteTail(const std::string& path, std::uint64_t offset, std::string_view bytes) override;
    void DeleteFile(const std::string& path) override;
    void RenameFile(const std::string& from, const std::string& to) override;
    void CopyFile(const std::string& from, const std::string& to) override;
    void MakeFolders(const std::string& path) override;
    std::uint64_t FileLength(const std::string& path) override;
    bool IsReadOnly(const std::string& path) override;
    std::int64_t FileTime(const std::string& path) override;
    std::vector<std::string> ListFiles(const std::string& folder, const std::string& pattern) override;
    std::vector<std::string> ListFolders(const std::string& folder) override;
    std::unique_ptr<FolderLock> LockFolder(const std::string& folder) override;
    std::string ToNative(const std::string& path) override;
    std::string FromNative(const std::string& nativePath) override;

private:
    /// Names of one folder under their folded form, good as long as the folder's time stands. Finding an
    /// absent file in a folder of thousands must not read the folder each time.
    struct Listing {
        std::timespec modified{};
        std::unordered_map<std::string, std::string> names;
    };

    std::string Resolve(const std::string& path);
    std::string ResolveBelow(std::string folder, const std::vector<std::string>& parts);
    std::string FindName(const std::string& folder, const std::string& name);
    Listing& ListingOf(const std::string& folder, const std::timespec& modified);
    void NoteEntry(const std::string& nativePath, bool present);
    std::string MapDrive(const std::string& path) const;

    std::string driveC_;
    std::unordered_map<std::string, Listing> listings_;
};

} // namespace tovimar::platform
