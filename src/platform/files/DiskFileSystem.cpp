#include "platform/files/DiskFileSystem.h"

#include "platform/files/FileFailure.h"
#include "platform/files/NativeFile.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <optional>
#include <unistd.h>
#include <utility>

namespace tovimar::platform {
namespace fs = std::filesystem;
namespace {

enum class Kind { Missing, File, Folder, Other };

Kind KindOf(const std::string& nativePath, struct stat* info = nullptr) {
    struct stat own {};
    struct stat& place = info != nullptr ? *info : own;
    if (stat(nativePath.c_str(), &place) != 0)
        return Kind::Missing;
    if (S_ISREG(place.st_mode))
        return Kind::File;
    return S_ISDIR(place.st_mode) ? Kind::Folder : Kind::Other;
}

/// As the platform does it: a read-only file isn't overwritten or deleted, whoever asks.
void RaiseIfReadOnly(const std::string& nativePath) {
    struct stat info {};
    if (KindOf(nativePath, &info) == Kind::File && (info.st_mode & S_IWUSR) == 0)
        RaiseFileNumber(kPathAccessError, nativePath);
}

/// The file behind links, so that a link stays one when its file is replaced.
std::string BehindLinks(const std::string& nativePath) {
    std::error_code failure;
    if (!fs::is_symlink(nativePath, failure))
        return nativePath;
    const auto target = fs::canonical(nativePath, failure);
    return failure ? nativePath : target.string();
}

enum class Durability { Ordinary, OnDisk };

/// Writes beside the target and moves the finished file over it.
void ReplaceFile(const std::string& nativePath, std::string_view bytes,
                 Durability durability = Durability::Ordinary) {
    const std::string target = BehindLinks(nativePath);
    NativeFile file = NativeFile::TemporaryBeside(target);
    try {
        file.WriteAll(bytes);
        if (durability == Durability::OnDisk)
            file.Sync();
        file.Close();
        if (rename(file.Path().c_str(), target.c_str()) != 0)
            RaiseFileFailure(errno, target);
    } catch (...) {
        unlink(file.Path().c_str());
        throw;
    }
}

/// A file's new name is on the disk when its folder is. The file itself is safe by now, so a folder that
/// can't be opened is no failure.
void SyncFolderOf(const std::string& nativePath) {
    const std::string target = BehindLinks(nativePath);
    try {
        NativeFile(target.substr(0, target.rfind('/') + 1), O_RDONLY | O_DIRECTORY).Sync();
    } catch (const RaisedError&) {
        return;
    }
}

/// A file that isn't there yet gets its name when it is finished, which is cheaper than a second name and a
/// rename and leaves nothing behind a killed program. File systems that can't do this get the rename.
void WriteNewFile(const std::string& nativePath, std::string_view bytes) {
    std::optional<NativeFile> file = NativeFile::UnnamedBeside(nativePath);
    if (file)
        file->WriteAll(bytes);
    if (!file || !file->GiveName())
        return ReplaceFile(nativePath, bytes);
    try {
        file->Close();
    } catch (...) {
        unlink(nativePath.c_str());
        throw;
    }
}

/// What stands behind `offset`; empty when that is more than an end.
std::string ShortTail(const NativeFile& file, std::uint64_t offset) {
    constexpr std::uint64_t kMost = 4096;
    const auto size = static_cast<std::uint64_t>(file.Info().st_size);
    if (size <= offset || size - offset > kMost)
        return {};
    file.SeekTo(static_cast<off_t>(offset));
    return file.ReadHere(size - offset);
}

void PutTail(const NativeFile& file, std::uint64_t offset, std::string_view bytes) {
    file.SeekTo(static_cast<off_t>(offset));
    file.WriteAll(bytes);
    file.CutHere();
}

/// The lock of a folder's descriptor, which goes when the process does, however it ends.
class HeldFolder : public FolderLock {
public:
    explicit HeldFolder(NativeFile folder) : folder_(std::move(folder)) {}

private:
    NativeFile folder_;
};

void SortIgnoringCase(std::vector<std::string>& names) {
    std::sort(names.begin(), names.end(), [](const std::string& left, const std::string& right) {
        const int order = text::CompareIgnoringCase(left, right);
        return order != 0 ? order < 0 : left < right;
    });
}

/// Names of one kind; a backslash in a name can't be written as a Windows path.
std::vector<std::string> NamesIn(const std::string& nativeFolder, bool folders, const std::string& pattern) {
    std::error_code failure;
    std::vector<std::string> names;
    fs::directory_iterator entries(nativeFolder, failure);
    if (failure)
        RaiseFileNumber(kPathNotFound, nativeFolder);
    for (const auto end = fs::directory_iterator(); entries != end; entries.increment(failure)) {
        const std::string name = entries->path().filename().string();
        const bool isFolder = entries->is_directory(failure);
        const bool wanted = folders ? isFolder : entries->is_regular_file(failure);
        if (wanted && name.find('\\') == std::string::npos && MatchesPattern(name, pattern))
            names.push_back(name);
    }
    SortIgnoringCase(names);
    return names;
}

} // namespace

bool DiskFileSystem::FileExists(const std::string& path) {
    return !path.empty() && KindOf(ToNative(path)) == Kind::File;
}

bool DiskFileSystem::FolderExists(const std::string& path) {
    return !path.empty() && KindOf(ToNative(path)) == Kind::Folder;
}

std::string DiskFileSystem::ReadFile(const std::string& path) {
    return NativeFile(Resolve(path), O_RDONLY).ReadAll();
}

void DiskFileSystem::WriteFile(const std::string& path, std::string_view bytes) {
    const std::string native = Resolve(path);
    const Kind kind = KindOf(native);
    if (kind == Kind::Folder)
        RaiseFileNumber(kPathAccessError, native);
    if (kind == Kind::Missing && !fs::is_symlink(fs::path(native))) {
        WriteNewFile(native, bytes);
    } else {
        RaiseIfReadOnly(native);
        ReplaceFile(native, bytes);
    }
    NoteEntry(native, true);
}

void DiskFileSystem::WriteFileToDisk(const std::string& path, std::string_view bytes) {
    const std::string native = Resolve(path);
    if (KindOf(native) == Kind::Folder)
        RaiseFileNumber(kPathAccessError, native);
    RaiseIfReadOnly(native);
    ReplaceFile(native, bytes, Durability::OnDisk);
    NoteEntry(native, true);
    SyncFolderOf(native);
}

void DiskFileSystem::AppendFile(const std::string& path, std::string_view bytes) {
    const std::string native = Resolve(path);
    RaiseIfReadOnly(native);
    NativeFile file(native, O_WRONLY | O_CREAT | O_APPEND);
    file.WriteAll(bytes);
    file.Close();
    NoteEntry(native, true);
}

void DiskFileSystem::OverwriteTail(const std::string& path, std::uint64_t offset, std::string_view bytes) {
    const std::string native = Resolve(path);
    RaiseIfReadOnly(native);
    NativeFile file(native, O_RDWR);
    const std::string before = ShortTail(file, offset);
    try {
        PutTail(file, offset, bytes);
    } catch (const RaisedError&) {
        // Its place on the disk was taken already, so what stood there fits again.
        if (!before.empty())
            PutTail(file, offset, before);
        throw;
    }
    file.Close();
}

void DiskFileSystem::DeleteFile(const std::string& path) {
    const std::string native = Resolve(path);
    RaiseIfReadOnly(native);
    if (KindOf(native) == Kind::Folder)
        RaiseFileNumber(kPathAccessError, native);
    if (unlink(native.c_str()) != 0)
        RaiseFileFailure(errno, native);
    NoteEntry(native, false);
}

void DiskFileSystem::RenameFile(const std::string& from, const std::string& to) {
    const std::string source = Resolve(from);
    std::string target = Resolve(to);
    if (KindOf(source) == Kind::Missing)
        RaiseFileFailure(ENOENT, source);
    // Only the case of the name changes: the entry found is the source itself, the new spelling counts.
    if (target == source)
        target = target.substr(0, target.rfind('/') + 1) + FileNameOf(to);
    else if (KindOf(target) != Kind::Missing)
        RaiseFileNumber(kFileAlreadyExists, target);
    if (rename(source.c_str(), target.c_str()) != 0)
        RaiseFileFailure(errno, target);
    NoteEntry(source, false);
    NoteEntry(target, true);
}

void DiskFileSystem::CopyFile(const std::string& from, const std::string& to) {
    const std::string source = Resolve(from);
    const std::string target = Resolve(to);
    if (source == target)
        return;
    RaiseIfReadOnly(target);
    const NativeFile file(source, O_RDONLY);
    const struct stat info = file.Info();
    ReplaceFile(target, file.ReadAll());
    // A copy is as old as what it is a copy of.
    const std::array<timespec, 2> times{info.st_atim, info.st_mtim};
    utimensat(AT_FDCWD, target.c_str(), times.data(), 0);
    NoteEntry(target, true);
}

void DiskFileSystem::MakeFolders(const std::string& path) {
    const std::string native = Resolve(path);
    const Kind kind = KindOf(native);
    if (kind == Kind::Folder)
        return;
    std::error_code failure;
    fs::create_directories(native, failure);
    if (failure)
        RaiseFileFailure(kind == Kind::Missing ? failure.value() : ENOTDIR, native);
    NoteEntry(native, true);
}

std::uint64_t DiskFileSystem::FileLength(const std::string& path) {
    const std::string native = Resolve(path);
    struct stat info {};
    if (KindOf(native, &info) != Kind::File)
        RaiseFileFailure(ENOENT, native);
    return static_cast<std::uint64_t>(info.st_size);
}

bool DiskFileSystem::IsReadOnly(const std::string& path) {
    const std::string native = ToNative(path);
    struct stat info {};
    return KindOf(native, &info) == Kind::File &&
           ((info.st_mode & S_IWUSR) == 0 || access(native.c_str(), W_OK) != 0);
}

std::int64_t DiskFileSystem::FileTime(const std::string& path) {
    const std::string native = Resolve(path);
    struct stat info {};
    if (KindOf(native, &info) != Kind::File)
        RaiseFileFailure(ENOENT, native);
    return info.st_mtime;
}

std::vector<std::string> DiskFileSystem::ListFiles(const std::string& folder, const std::string& pattern) {
    return NamesIn(Resolve(folder), false, pattern);
}

std::unique_ptr<FolderLock> DiskFileSystem::LockFolder(const std::string& folder) {
    constexpr int kTries = 500;
    constexpr useconds_t kPause = 10'000;
    try {
        NativeFile place(Resolve(folder), O_RDONLY | O_DIRECTORY);
        for (int i = 0; i < kTries; ++i) {
            if (place.TryLock())
                return std::make_unique<HeldFolder>(std::move(place));
            usleep(kPause);
        }
    } catch (const RaisedError&) {
        return nullptr;
    }
    return nullptr;
}

std::vector<std::string> DiskFileSystem::ListFolders(const std::string& folder) {
    return NamesIn(Resolve(folder), true, {});
}

} // namespace tovimar::platform
