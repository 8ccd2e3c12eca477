#include "cli/TouchedFiles.h"

#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"

namespace tovimar::cli {
namespace {

void PutBack(const std::string& path, const std::optional<std::string>& bytes) {
    auto& files = *platform::Env().files;
    const bool there = files.FileExists(path);
    if (!bytes && there)
        files.DeleteFile(path);
    else if (bytes && (!there || files.ReadFile(path) != *bytes))
        files.WriteFile(path, *bytes);
}

} // namespace

void TouchedFiles::Remember(const std::string& path) {
    auto& files = *platform::Env().files;
    if (path.empty() || before_.contains(path))
        return;
    before_[path] = files.FileExists(path) ? std::optional(files.ReadFile(path)) : std::nullopt;
}

TouchedFiles::~TouchedFiles() {
    for (const auto& file : before_)
        PassOver([&] { PutBack(file.first, file.second); });
}

} // namespace tovimar::cli
