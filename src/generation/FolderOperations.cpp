#include "generation/FolderOperations.h"

#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"

#include <array>
#include <cstdio>

namespace tovimar {
namespace {

std::string BackupFolderName() {
    const auto now = platform::Env().clock->Now();
    std::array<char, 40> name{};
    std::snprintf(name.data(), name.size(), "BAK_%04d_%02d_%02d_%02d_%02d_%02d\\", now.year, now.month,
                  now.day, now.hour, now.minute, now.second);
    return name.data();
}

/// Folders end in a backslash.
void CopyFolder(const std::string& from, const std::string& to) {
    platform::Env().files->MakeFolders(to);
    CopyFilesByMask(from, to, "*.*");
    for (const std::string& folder : platform::Env().files->ListFolders(from))
        CopyFolder(from + folder + "\\", to + folder + "\\");
}

} // namespace

bool CreateFolderPath(const std::string& vstrPath) {
    try {
        platform::Env().files->MakeFolders(vstrPath);
        return true;
    } catch (const RaisedError&) {
        return false;
    }
}

bool TestFolderWritable(const std::string& vstrFolder) {
    auto& files = *platform::Env().files;
    const std::string probe = platform::Join(vstrFolder, "test.txt");
    try {
        // Somebody's own file of that name is only opened; an empty one is what a killed run has left.
        const bool taken = files.FileExists(probe) && files.FileLength(probe) > 0;
        files.AppendFile(probe, {});
        if (!taken)
            files.DeleteFile(probe);
        return true;
    } catch (const RaisedError&) {
        return false;
    }
}

std::int32_t ShellExecute(const std::string& vstrFile, const std::string& /*vstrVerb*/,
                          const std::string& vstrParameters, bool vfWait) {
    constexpr std::int32_t kDone = 42;
    constexpr std::int32_t kNoProgram = 31;
    if (!vfWait && vstrParameters.empty())
        return platform::Env().processes->Open(vstrFile) ? kDone : kNoProgram;
    const ResultCode result =
        ShellAndWait("\"" + vstrFile + "\"" + (vstrParameters.empty() ? "" : " " + vstrParameters), 1);
    return result == kSuccess ? kDone : result;
}

ResultCode ShellAndWait(const std::string& vstrCommand, std::int32_t /*vlngWindowStyle*/) {
    try {
        platform::Env().processes->RunAndWait(vstrCommand);
        return kSuccess;
    } catch (const RaisedError& failure) {
        return failure.Number();
    }
}

std::string MakeBackupForFolder(const std::string& vstrFolder) {
    std::string backup;
    Trapped("modTovimarUtils", "MakeBackupForFolder", [&] {
        auto& files = *platform::Env().files;
        const std::string folder = platform::WithTrailingBackslash(vstrFolder);
        if (!files.FolderExists(folder) ||
            (files.ListFiles(folder, "*.*").empty() && files.ListFolders(folder).empty()))
            return;
        const std::string target =
            platform::FolderOf(platform::WithoutTrailingBackslash(folder)) + BackupFolderName();
        CopyFolder(folder, target);
        backup = target;
    });
    return backup;
}

void CopyFilesByMask(const std::string& vstrSourceFolder, const std::string& vstrTargetFolder,
                     const std::string& vstrMask) {
    auto& files = *platform::Env().files;
    if (!files.FolderExists(vstrSourceFolder))
        return;
    for (const std::string& file : files.ListFiles(vstrSourceFolder, vstrMask))
        files.CopyFile(platform::Join(vstrSourceFolder, file), platform::Join(vstrTargetFolder, file));
}

void RemoveUnfinishedFiles(const std::string& vstrFolder) {
    auto& files = *platform::Env().files;
    if (vstrFolder.empty() || !files.FolderExists(vstrFolder))
        return;
    for (const auto& name : files.ListFiles(vstrFolder, platform::FileSystem::kUnfinishedFiles))
        PassOver([&] { files.DeleteFile(platform::Join(vstrFolder, name)); });
}

std::int32_t GetPathAttributes(const std::string& vstrPath) {
    auto& files = *platform::Env().files;
    if (files.FolderExists(vstrPath))
        return kAttributeFolder;
    if (!files.FileExists(vstrPath))
        return -1;
    return kAttributeFile | (files.IsReadOnly(vstrPath) ? kAttributeReadOnly : 0);
}

} // namespace tovimar
