#include "foundation/BackupFileName.h"

#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"

#include <cstdio>

namespace tovimar {

std::string BackupFileName(const std::string& path) {
    auto& environment = platform::Env();
    const auto now = environment.clock->Now();
    char date[24];
    std::snprintf(date, sizeof date, "_%04d%02d%02d", now.year, now.month, now.day);
    const std::string extension = platform::ExtensionOf(path);
    const std::string base = path.substr(0, path.size() - extension.size()) + date;
    std::string candidate = base + extension;
    for (int counter = 1; environment.files->FileExists(candidate); ++counter)
        candidate = base + std::to_string(counter) + extension;
    return candidate;
}

bool BackUpFile(const std::string& path) {
    auto& files = *platform::Env().files;
    if (!files.FileExists(path))
        return true;
    bool done = false;
    PassOver([&] {
        files.CopyFile(path, BackupFileName(path));
        done = true;
    });
    return done;
}

} // namespace tovimar
