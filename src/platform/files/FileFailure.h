#pragma once

#include <string>

namespace tovimar::platform {

/// Raises the numbered failure for an errno value, with the native path in the text.
[[noreturn]] void RaiseFileFailure(int error, const std::string& nativePath);

constexpr int kFileNotFound = 53;
constexpr int kFileAlreadyExists = 58;
constexpr int kDiskFull = 61;
constexpr int kPermissionDenied = 70;
constexpr int kPathAccessError = 75;
constexpr int kPathNotFound = 76;

[[noreturn]] void RaiseFileNumber(int number, const std::string& nativePath);

} // namespace tovimar::platform
