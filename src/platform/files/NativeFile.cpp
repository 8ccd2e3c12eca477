#include "platform/files/NativeFile.h"

#include "platform/files/FileFailure.h"

#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>
#include <utility>

namespace tovimar::platform {
namespace {

mode_t ModeForNewFiles() {
    static const mode_t mask = [] {
        const mode_t current = umask(0);
        umask(current);
        return current;
    }();
    return static_cast<mode_t>(0666 & ~mask);
}

} // namespace

NativeFile::NativeFile(const std::string& path, int flags)
    // Without O_NONBLOCK the opening of a pipe with nobody at its other end would never return.
    : descriptor_(open(path.c_str(), flags | O_CLOEXEC | O_NONBLOCK, 0666)), path_(path), told_(path) {
    if (descriptor_ < 0)
        RaiseFileFailure(errno, told_);
}

NativeFile NativeFile::TemporaryBeside(const std::string& target) {
    std::string pattern = target.substr(0, target.rfind('/') + 1) + ".tovimar-XXXXXX";
    const int descriptor = mkostemp(pattern.data(), O_CLOEXEC);
    if (descriptor < 0)
        RaiseFileFailure(errno, target);
    NativeFile file(descriptor, pattern, target);
    struct stat info {};
    const bool stands = stat(target.c_str(), &info) == 0;
    // Before the mode: a change of the owner takes bits of it away.
    if (stands && fchown(descriptor, info.st_uid, info.st_gid) != 0)
        errno = 0;
    fchmod(descriptor, stands ? info.st_mode & 07777 : ModeForNewFiles());
    return file;
}

std::optional<NativeFile> NativeFile::UnnamedBeside(const std::string& target) {
    const std::string folder = target.substr(0, target.rfind('/') + 1) + ".";
    const int descriptor = open(folder.c_str(), O_TMPFILE | O_WRONLY | O_CLOEXEC, 0666);
    if (descriptor < 0)
        return std::nullopt;
    return NativeFile(descriptor, target, target);
}

NativeFile NativeFile::ScratchIn(const std::string& folder) {
    std::string pattern = folder + "/.tovimar-XXXXXX";
    const int descriptor = mkostemp(pattern.data(), O_CLOEXEC);
    if (descriptor < 0)
        RaiseFileFailure(errno, folder);
    unlink(pattern.c_str());
    return NativeFile(descriptor, pattern, folder);
}

bool NativeFile::GiveName() {
    const std::string self = "/proc/self/fd/" + std::to_string(descriptor_);
    return linkat(AT_FDCWD, self.c_str(), AT_FDCWD, path_.c_str(), AT_SYMLINK_FOLLOW) == 0;
}

NativeFile::~NativeFile() {
    if (descriptor_ >= 0)
        close(descriptor_);
}

NativeFile::NativeFile(NativeFile&& other) noexcept
    : descriptor_(std::exchange(other.descriptor_, -1)), path_(std::move(other.path_)),
      told_(std::move(other.told_)) {}

struct stat NativeFile::Info() const {
    struct stat info {};
    if (fstat(descriptor_, &info) != 0)
        RaiseFileFailure(errno, told_);
    return info;
}

std::string NativeFile::ReadAll() const {
    const auto info = Info();
    if (!S_ISREG(info.st_mode))
        RaiseFileNumber(kPathAccessError, told_);
    return ReadHere(static_cast<std::size_t>(info.st_size));
}

std::string NativeFile::ReadHere(std::size_t most) const {
    std::string bytes(most, '\0');
    std::size_t done = 0;
    while (done < bytes.size()) {
        const ssize_t got = read(descriptor_, bytes.data() + done, bytes.size() - done);
        if (got < 0 && errno == EINTR)
            continue;
        if (got < 0)
            RaiseFileFailure(errno, told_);
        if (got == 0)
            break;
        done += static_cast<std::size_t>(got);
    }
    bytes.resize(done);
    return bytes;
}

void NativeFile::WriteAll(std::string_view bytes) const {
    while (!bytes.empty()) {
        const ssize_t written = write(descriptor_, bytes.data(), bytes.size());
        if (written < 0 && errno == EINTR)
            continue;
        if (written < 0)
            RaiseFileFailure(errno, told_);
        bytes.remove_prefix(static_cast<std::size_t>(written));
    }
}

void NativeFile::SeekTo(off_t offset) const {
    if (lseek(descriptor_, offset, SEEK_SET) < 0)
        RaiseFileFailure(errno, told_);
}

void NativeFile::CutHere() const {
    const off_t end = lseek(descriptor_, 0, SEEK_CUR);
    if (end < 0 || ftruncate(descriptor_, end) != 0)
        RaiseFileFailure(errno, told_);
}

void NativeFile::Sync() const {
    if (fsync(descriptor_) != 0 && errno != EINVAL && errno != ENOTSUP)
        RaiseFileFailure(errno, told_);
}

bool NativeFile::TryLock() const {
    return flock(descriptor_, LOCK_EX | LOCK_NB) == 0;
}

void NativeFile::Close() {
    if (close(std::exchange(descriptor_, -1)) != 0)
        RaiseFileFailure(errno, told_);
}

} // namespace tovimar::platform
