#include "foundation/ErrorTrap.h"
#include "generation/HelpUtilities.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <array>

/// Where the help compiler is: its own programs leave their places in the registry.
namespace tovimar {
namespace {

constexpr const char* kCompiler = "hhc.exe";
constexpr const char* kAppPath =
    "HKEY_LOCAL_MACHINE\\SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\App Paths\\hhw.exe";

constexpr std::array<const char*, 5> kOpenCommands{
    "HKEY_CLASSES_ROOT\\hhp.file\\shell\\open\\command",
    "HKEY_CLASSES_ROOT\\hhc.file\\shell\\open\\command",
    "HKEY_CLASSES_ROOT\\hhk.file\\shell\\open\\command",
    "HKEY_CLASSES_ROOT\\Applications\\hhw.exe\\shell\\open\\command",
    "HKEY_LOCAL_MACHINE\\SOFTWARE\\Classes\\Applications\\hhw.exe\\shell\\open\\command",
};

constexpr std::array<const char*, 2> kIcons{
    "HKEY_LOCAL_MACHINE\\SOFTWARE\\Classes\\Hhc.File\\DefaultIcon",
    "HKEY_LOCAL_MACHINE\\SOFTWARE\\Classes\\hhp.file\\DefaultIcon",
};

template <std::size_t N> std::string FirstValue(const std::array<const char*, N>& keys) {
    for (const char* key : keys)
        if (std::string value = platform::Env().registry->Read(key); !value.empty())
            return value;
    return {};
}

std::string WithoutQuotes(const std::string& text) {
    return text::Trim(text::ReplaceAll(text, "\"", ""));
}

/// Folder of a path of the workshop's program.
std::string FolderOfProgram(const std::string& path) {
    return text::ReplaceAllIgnoringCase(WithoutQuotes(path), "hhw.exe", "");
}

bool HasCompiler(const std::string& folder) {
    return !folder.empty() && platform::Env().files->FileExists(folder + kCompiler);
}

/// What stands before the mark, as a folder; empty without the mark or without the compiler there.
std::string FolderBefore(const std::string& value, const char* mark) {
    const auto position = value.find(mark);
    if (position == std::string::npos)
        return {};
    const std::string folder = FolderOfProgram(value.substr(0, position));
    return HasCompiler(folder) ? folder : std::string();
}

std::string FolderByIcon() {
    const std::string value = FirstValue(kIcons);
    const char* mark = value.find(",3") != std::string::npos ? ",3" : ",5";
    return FolderBefore(value, mark);
}

std::string FolderByAppPath() {
    auto& registry = *platform::Env().registry;
    if (const std::string program = registry.Read(kAppPath); !program.empty())
        return FolderOfProgram(program);
    return platform::WithTrailingBackslash(WithoutQuotes(registry.Read(kAppPath, "Path")));
}

std::string FindFolder() {
    std::string folder = FolderBefore(FirstValue(kOpenCommands), "%1");
    if (folder.empty())
        folder = FolderByIcon();
    if (folder.empty())
        folder = FolderByAppPath();
    if (folder.empty())
        folder = platform::Join(platform::Env().folders.programFiles, "HTML Help Workshop\\");
    return HasCompiler(folder) ? folder : std::string();
}

} // namespace

std::string GetHtmlHelpWorkshopExePath() {
    std::string folder;
    Trapped("modTovimarHHWInfo", "GetHtmlHelpWorkshopExePath", [&] { folder = FindFolder(); });
    return folder;
}

} // namespace tovimar
