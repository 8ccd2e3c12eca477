#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <sys/stat.h>

/// Whole reads and writes of native files. All raise as FileSystem does.
namespace tovimar::platform {

/// An open file descriptor, closed at the end.
class NativeFile {
public:
    NativeFile(const std::string& path, int flags);
    /// A fresh file beside `target` with the access rights, and where that is allowed the owner, that
    /// `target` has, or a new file gets.
    static NativeFile TemporaryBeside(const std::string& target);
    /// A fresh file without a name where `target` is to stand, gone when it never gets it. None where the
    /// file system has no such files, or the folder can't be written to.
    static std::optional<NativeFile> UnnamedBeside(const std::string& target);
    /// A fresh file without a name, to be written, read and forgotten. Failures name the folder.
    static NativeFile ScratchIn(const std::string& folder);
    /// Of an unnamed file, the name that it was opened for. False where it can't get it, for one because it
    /// is taken by now.
    bool GiveName();
    ~NativeFile();
    NativeFile(NativeFile&& other) noexcept;
    NativeFile& operator=(NativeFile&&) = delete;

    const std::string& Path() const { return path_; }
    struct stat Info() const;
    std::string ReadAll() const;
    /// From where the file stands, at most so many bytes.
    std::string ReadHere(std::size_t most) const;
    void WriteAll(std::string_view bytes) const;
    void SeekTo(off_t offset) const;
    void CutHere() const;
    /// Waits until what was written is on the disk. What can't be waited for, such as a pipe, is no failure.
    void Sync() const;
    /// Without waiting; false while another process holds the lock.
    bool TryLock() const;
    /// Reports what writing left unreported.
    void Close();

private:
    NativeFile(int descriptor, std::string path, std::string told)
        : descriptor_(descriptor), path_(std::move(path)), told_(std::move(told)) {}

    int descriptor_ = -1;
    std::string path_;
    std::string told_; ///< what failures name: of a temporary file the one that it is for
};

} // namespace tovimar::platform
