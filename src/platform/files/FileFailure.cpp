#include "platform/files/FileFailure.h"

#include "platform/Error.h"

#include <cerrno>
#include <sys/stat.h>

namespace tovimar::platform {
namespace {

const char* TextOf(int number) {
    switch (number) {
    case kFileNotFound:
        return "File not found";
    case kFileAlreadyExists:
        return "File already exists";
    case kDiskFull:
        return "Disk full";
    case kPermissionDenied:
        return "Permission denied";
    case kPathNotFound:
        return "Path not found";
    default:
        return "Path/File access error";
    }
}

bool ParentExists(const std::string& nativePath) {
    const auto slash = nativePath.rfind('/');
    struct stat info {};
    return slash == std::string::npos || slash == 0 || stat(nativePath.substr(0, slash).c_str(), &info) == 0;
}

int NumberOf(int error, const std::string& nativePath) {
    switch (error) {
    case ENOENT:
        return ParentExists(nativePath) ? kFileNotFound : kPathNotFound;
    case ENOTDIR:
        return kPathNotFound;
    case EEXIST:
        return kFileAlreadyExists;
    case EACCES:
    case EPERM:
    case EROFS:
        return kPermissionDenied;
    case ENOSPC:
    case EDQUOT:
        return kDiskFull;
    default:
        return kPathAccessError;
    }
}

} // namespace

void RaiseFileNumber(int number, const std::string& nativePath) {
    throw RaisedError(number, std::string(TextOf(number)) + ": '" + nativePath + "'", "FileSystem");
}

void RaiseFileFailure(int error, const std::string& nativePath) {
    RaiseFileNumber(NumberOf(error, nativePath), nativePath);
}

} // namespace tovimar::platform
