#pragma once

#include "platform/Environment.h"
#include "platform/files/FileFailure.h"
#include "platform/text/Text.h"

#include <map>

namespace tovimar::fuzz {

/// Files in memory, any folder of which exists; a target's readers and writers never touch the disk.
class MemoryFiles : public platform::FileSystem {
public:
    std::map<std::string, std::string> files; // by folded path

    bool FileExists(const std::string& path) override { return files.count(text::FoldCase(path)) != 0; }
    bool FolderExists(const std::string&) override { return true; }
    std::string ReadFile(const std::string& path) override {
        const auto found = files.find(text::FoldCase(path));
        if (found == files.end())
            platform::RaiseFileNumber(platform::kFileNotFound, path);
        return found->second;
    }
    void WriteFile(const std::string& path, std::string_view bytes) override {
        files[text::FoldCase(path)] = bytes;
    }
    void WriteFileToDisk(const std::string& path, std::string_view bytes) override { WriteFile(path, bytes); }
    void AppendFile(const std::string& path, std::string_view bytes) override {
        files[text::FoldCase(path)] += bytes;
    }
    void OverwriteTail(const std::string& path, std::uint64_t offset, std::string_view bytes) override {
        WriteFile(path, ReadFile(path).substr(0, offset) + std::string(bytes));
    }
    void DeleteFile(const std::string& path) override { files.erase(text::FoldCase(path)); }
    void RenameFile(const std::string& from, const std::string& to) override {
        CopyFile(from, to);
        DeleteFile(from);
    }
    void CopyFile(const std::string& from, const std::string& to) override { WriteFile(to, ReadFile(from)); }
    void MakeFolders(const std::string&) override {}
    std::uint64_t FileLength(const std::string& path) override { return ReadFile(path).size(); }
    bool IsReadOnly(const std::string&) override { return false; }
    std::int64_t FileTime(const std::string&) override { return 0; }
    std::vector<std::string> ListFiles(const std::string&, const std::string&) override { return {}; }
    std::vector<std::string> ListFolders(const std::string&) override { return {}; }
    std::unique_ptr<platform::FolderLock> LockFolder(const std::string&) override { return nullptr; }
    std::string ToNative(const std::string& path) override { return path; }
    std::string FromNative(const std::string& nativePath) override { return nativePath; }
};

/// Puts a fresh one in force, with one file in it.
inline MemoryFiles& FilesWith(const std::string& path, std::string_view bytes) {
    auto made = std::make_unique<MemoryFiles>();
    MemoryFiles& files = *made;
    files.WriteFile(path, bytes);
    platform::Env().files = std::move(made);
    return files;
}

} // namespace tovimar::fuzz
