#include "cli/Stop.h"

#include "cli/Console.h"
#include "cli/Surroundings.h"
#include "foundation/ShowMessage.h"
#include "platform/Environment.h"
#include "platform/Interrupt.h"

#include <filesystem>

namespace tovimar::cli {

void StopIfInterrupted() {
    if (platform::InterruptRequested())
        throw Stop{"interrupted", kInterrupted};
}

std::string FullPath(const std::string& native) {
    const std::filesystem::path whole = std::filesystem::absolute(native);
    std::error_code unreadable;
    const std::filesystem::path resolved = std::filesystem::weakly_canonical(whole, unreadable);
    return (unreadable ? whole.lexically_normal() : resolved).string();
}

void ShowFile(const char* what, const std::string& path) {
    auto& files = *platform::Env().files;
    if (!path.empty() && files.FileExists(path))
        PrintResult(what + files.ToNative(path));
}

int RunToStop(Surroundings& surroundings, const std::function<int()>& steps) {
    try {
        return steps();
    } catch (const Stop& stop) {
        surroundings.Progress().Clear();
        if (!stop.message.empty())
            PrintError(NativePathsInText(stop.message));
        return stop.exitCode;
    }
}

} // namespace tovimar::cli
