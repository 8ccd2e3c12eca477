#include "host/sources/SourceFileText.h"

#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/access/ExportReader.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

/// Far above any file that a designer writes.
constexpr std::uint64_t kMostBytes = std::uint64_t{16} << 20U;

} // namespace

std::string ReadSourceFile(const std::string& path) {
    platform::FileSystem& files = *platform::Env().files;
    if (files.FileLength(path) > kMostBytes)
        throw RaisedError(kFailure1, files.ToNative(path) + ": the file is larger than 16 MiB.",
                          "ReadSourceFile");
    return platform::access::DecodeExportText(files.ReadFile(path));
}

std::string SourceFilePath(const std::string& projectFolder, const std::string& path) {
    const bool whole = path.starts_with("\\\\") || path.find(':') != std::string::npos;
    return whole ? path : platform::Join(projectFolder, path);
}

} // namespace tovimar
