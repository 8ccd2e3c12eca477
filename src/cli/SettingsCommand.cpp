#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Json.h"
#include "cli/ProjectFile.h"
#include "cli/SettingsFile.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/Paths.h"
#include "generation/CAddInSettings.h"
#include "host/server/CTovimarServer.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"

#include <filesystem>
#include <nlohmann/json.hpp>
#include <string_view>
#include <unistd.h>

namespace tovimar::cli {
namespace {

constexpr std::string_view kBoolean = "true|false";

/// The file whose options are meant.
std::string PathOf(const Arguments& arguments) {
    return arguments.project.empty() ? GlobalSettingsFile() : FindProjectFile(arguments.project);
}

const OptionDescription& Described(const std::string& name) {
    for (const OptionDescription& option : OptionDescriptions())
        if (name == option.name)
            return option;
    throw Stop{"there is no option '" + name + "'", kUsage};
}

/// Three options are a project's own: the global file's are never read.
void RefuseOption(const Arguments& arguments, const OptionDescription& option) {
    if (option.ofProject && arguments.project.empty())
        throw Stop{std::string(option.name) + " belongs to a help project; --project names it", kUsage};
}

nlohmann::ordered_json ValueAsJson(const OptionDescription& option, const std::string& value) {
    const bool flag = value == "true" || value == "false";
    return option.values == kBoolean && flag ? nlohmann::ordered_json(value == "true")
                                             : nlohmann::ordered_json(value);
}

int ListAll(const Arguments& arguments) {
    const SettingsFile file(PathOf(arguments));
    auto all = nlohmann::ordered_json::object();
    for (const OptionDescription& option : OptionDescriptions()) {
        if (option.ofProject && arguments.project.empty())
            continue;
        const std::string value = file.Value(option.name);
        if (arguments.json)
            all[option.name] = ValueAsJson(option, value);
        else
            PrintResult(std::string(option.name) + "=" + value);
    }
    if (arguments.json)
        PrintJson(all);
    return kDone;
}

int Get(const Arguments& arguments) {
    const OptionDescription& option = Described(arguments.settingName);
    RefuseOption(arguments, option);
    const std::string value = SettingsFile(PathOf(arguments)).Value(option.name);
    if (arguments.json)
        PrintJson({{"name", option.name}, {"value", ValueAsJson(option, value)}});
    else
        PrintResult(value);
    return kDone;
}

/// The user's own settings begin as a copy of the shipped ones.
std::string OwnSettings() {
    auto& files = *platform::Env().files;
    const std::string own = UserSettingsFile();
    if (!files.FileExists(own)) {
        files.MakeFolders(platform::FolderOf(own));
        files.WriteFileToDisk(own, files.ReadFile(ShippedSettingsFile()));
    }
    return own;
}

/// A style sheet that was typed as a path is one of this machine.
std::string StoredValue(const std::string& name, const std::string& value) {
    const bool path = value.find('/') != std::string::npos &&
                      (name == "CSSFullPath" || name == "FolderForGeneratedHelp" ||
                       name == "LastUsedFolderForGeneratedHelp" || name == "LastUsedFolderForCapturedImages");
    return path ? platform::Env().files->FromNative(FullPath(value)) : value;
}

int Set(const Arguments& arguments) {
    const OptionDescription& option = Described(arguments.settingName);
    RefuseOption(arguments, option);
    const std::string path = arguments.project.empty() ? OwnSettings() : PathOf(arguments);
    SettingsFile file(path);
    if (access(platform::Env().files->ToNative(path).c_str(), W_OK) != 0)
        throw Stop{"no permission to change '" + path + "'" +
                   (arguments.project.empty() ? "\n--project changes the options of one help project." : "")};
    if (!arguments.project.empty() && !TheServer().BackUpHelpProjectFile(path))
        throw Stop{"no backup of '" + path + "' can be made; nothing was changed"};
    file.SetValue(option.name, StoredValue(option.name, arguments.settingValue));
    if (arguments.json)
        PrintJson({{"name", option.name}, {"value", ValueAsJson(option, file.Value(option.name))}});
    return kDone;
}

} // namespace

int ListSettings(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return ListAll(arguments); });
}

int GetSetting(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Get(arguments); });
}

int SetSetting(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Set(arguments); });
}

} // namespace tovimar::cli
