#include "platform/Environment.h"

#include "platform/Error.h"
#include "platform/MessageBoxAnswers.h"
#include "platform/files/DiskFileSystem.h"
#include "platform/files/Paths.h"
#include "platform/processes/RealProcesses.h"
#include "platform/registry/IniRegistry.h"
#include "platform/windowing/WindowSystem.h"

#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <pwd.h>
#include <random>
#include <unicode/uloc.h>
#include <unistd.h>

namespace tovimar::platform {
namespace {

std::unique_ptr<Environment>& InForce() {
    static std::unique_ptr<Environment> environment;
    return environment;
}

class SystemClock : public Clock {
public:
    DateTime Now() override {
        timespec now{};
        clock_gettime(CLOCK_REALTIME, &now);
        DateTime local = LocalTime(now.tv_sec);
        local.secondsSinceMidnight += static_cast<double>(now.tv_nsec) / 1e9;
        return local;
    }
    double Timer() override { return Now().secondsSinceMidnight; }
};

/// Random identifiers, version 4.
class RandomIdentifiers : public Identifiers {
public:
    std::string NewGuid() override {
        std::random_device source;
        const auto word = [&] { return static_cast<std::uint32_t>(source()); };
        const std::uint32_t a = word(), b = word(), c = word(), d = word();
        char text[40];
        std::snprintf(text, sizeof text, "{%08X-%04X-4%03X-%04X-%04X%08X}", a, b >> 16U, b & 0xFFFU,
                      0x8000U | ((c >> 16U) & 0x3FFFU), c & 0xFFFFU, d);
        return text;
    }
};

class DefaultMessageBoxes : public MessageBoxes {
public:
    int Show(const std::string&, std::uint32_t flags, const std::string&) override {
        return DefaultMessageBoxAnswer(flags);
    }
};

class NoProgress : public ProgressView {
public:
    void Begin(const std::string&, std::int32_t) override {}
    void Update(const std::string&, std::int32_t) override {}
    void End() override {}
};

class NoHelpViewer : public HelpViewer {
public:
    std::int32_t Show(std::int32_t, const std::string&, std::uint32_t, const std::string&) override {
        return 0;
    }
};

class NoTimers : public Timers {
public:
    std::int32_t Start(std::int32_t, std::function<void()>) override { return 1; }
    void Stop(std::int32_t) override {}
};

std::string Variable(const char* name) {
    const char* value = std::getenv(name);
    return value != nullptr ? value : "";
}

/// A folder of the desktop's rules: the variable when it is an absolute path, else below the home folder.
std::string DesktopFolder(const char* variable, const char* belowHome) {
    const std::string value = Variable(variable);
    if (value.starts_with('/'))
        return value + "/tovimar";
    const std::string home = Variable("HOME");
    return (home.empty() ? "/tmp" : home) + belowHome + "/tovimar";
}

std::string UserName() {
    if (const passwd* entry = getpwuid(getuid()); entry != nullptr && entry->pw_name != nullptr)
        return entry->pw_name;
    return Variable("USER");
}

/// Language of the user's surroundings as a Windows number; English (United States) when none is set.
std::int32_t LanguageId() {
    std::string name;
    for (const char* variable : {"LC_ALL", "LC_MESSAGES", "LANG"})
        if (name.empty())
            name = Variable(variable);
    name = name.substr(0, name.find('.'));
    if (name.empty() || name == "C" || name == "POSIX")
        return 1033;
    const auto number = static_cast<std::int32_t>(uloc_getLCID(name.c_str()));
    return number != 0 ? number : 1033;
}

std::string ProgramFolder() {
    char path[4096];
    const ssize_t length = readlink("/proc/self/exe", path, sizeof path);
    const std::string program(path, length > 0 ? static_cast<std::size_t>(length) : 0);
    return program.substr(0, program.rfind('/') + 1);
}

KnownFolders MakeFolders(FileSystem& files, const std::string& programFolder) {
    const std::string temporary = Variable("TMPDIR");
    KnownFolders folders;
    folders.temporary = WithTrailingBackslash(files.FromNative(temporary.empty() ? "/tmp" : temporary));
    constexpr const char* kMemory = "/dev/shm";
    if (temporary.empty() && access(kMemory, W_OK | X_OK) == 0)
        folders.passing = WithTrailingBackslash(files.FromNative(kMemory));
    folders.applicationData = "C:\\Application Data\\";
    folders.programFiles = "C:\\Program Files\\";
    folders.program =
        WithTrailingBackslash(files.FromNative(programFolder.empty() ? ProgramFolder() : programFolder));
    return folders;
}

} // namespace

Environment::Environment() = default;
Environment::~Environment() = default;
Environment::Environment(Environment&&) noexcept = default;
Environment& Environment::operator=(Environment&&) noexcept = default;

DateTime LocalTime(std::int64_t secondsSince1970) {
    const auto seconds = static_cast<std::time_t>(secondsSince1970);
    std::tm local{};
    localtime_r(&seconds, &local);
    return {local.tm_year + 1900,
            local.tm_mon + 1,
            local.tm_mday,
            local.tm_hour,
            local.tm_min,
            local.tm_sec,
            static_cast<double>(local.tm_hour * 3600 + local.tm_min * 60 + local.tm_sec)};
}

Environment& Env() {
    if (!InForce())
        throw RaisedError(kGeneralFailure, "No environment is in force", "Environment");
    return *InForce();
}

std::unique_ptr<Environment> SetEnvironment(std::unique_ptr<Environment> environment) {
    InForce().swap(environment);
    return environment;
}

std::unique_ptr<Environment> MakeRealEnvironment(const RealEnvironmentOptions& options) {
    const std::string data =
        options.dataFolder.empty() ? DesktopFolder("XDG_DATA_HOME", "/.local/share") : options.dataFolder;
    const std::string config =
        options.configFolder.empty() ? DesktopFolder("XDG_CONFIG_HOME", "/.config") : options.configFolder;
    auto environment = std::make_unique<Environment>();
    environment->files = std::make_unique<DiskFileSystem>(data + "/drive_c");
    environment->registry = std::make_unique<IniRegistry>(config + "/registry.ini");
    environment->processes = std::make_unique<RealProcesses>(*environment->files);
    environment->clock = std::make_unique<SystemClock>();
    environment->identifiers = std::make_unique<RandomIdentifiers>();
    environment->messageBoxes = std::make_unique<DefaultMessageBoxes>();
    environment->hostMeter = std::make_unique<NoProgress>();
    environment->progressWindow = std::make_unique<NoProgress>();
    environment->helpViewer = std::make_unique<NoHelpViewer>();
    environment->windows = std::make_unique<WindowSystem>();
    environment->timers = std::make_unique<NoTimers>();
    environment->folders = MakeFolders(*environment->files, options.programFolder);
    environment->userName = UserName();
    environment->languageId = LanguageId();
    return environment;
}

} // namespace tovimar::platform
