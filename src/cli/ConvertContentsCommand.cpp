#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "platform/Environment.h"
#include "project/clsHHCLoader.h"

namespace tovimar::cli {
namespace {

int Convert(const Arguments& arguments) {
    auto& files = *platform::Env().files;
    const std::string source = files.FromNative(FullPath(arguments.source));
    clsHHCLoader loader;
    if (loader.Load(source) != kSuccess)
        throw Stop{{}, kFailed};
    if (loader.ErrorCode() != kSuccess)
        throw Stop{"'" + source + "' is no contents file: " + loader.ErrorReason()};
    if (loader.Root() == nullptr)
        throw Stop{"'" + source + "' holds no contents entries"};
    if (arguments.output.empty()) {
        PrintRaw(loader.GetXMLStr());
        return kDone;
    }
    const std::string target = files.FromNative(FullPath(arguments.output));
    if (loader.SaveXml(target) != kSuccess)
        return kFailed;
    ShowFile("Contents: ", target);
    return kDone;
}

} // namespace

int ConvertContents(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Convert(arguments); });
}

} // namespace tovimar::cli
