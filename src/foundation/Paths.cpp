#include "foundation/Paths.h"

#include "foundation/Product.h"
#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

using platform::Env;
using platform::FileNameOf;
using platform::WithTrailingBackslash;

std::string ProductFile(const char* rest) {
    return std::string(kProductFileName) + rest;
}

/// The folder that a redirect file names, else the given one.
std::string Redirected(const char* fileName, const std::string& folder) {
    const std::string value = RedirectValue(fileName);
    return WithTrailingBackslash(value.empty() ? folder : value);
}

/// A language folder counts when it has a welcome page; empty otherwise.
std::string LanguageFolder(const std::string& language) {
    if (language.empty())
        return {};
    const std::string folder = TemplatesFolder() + "Localized\\" + language + "\\";
    return Env().files->FileExists(folder + "Welcome.htm") ? folder : std::string();
}

} // namespace

std::string InstallationFolder() {
    auto& environment = Env();
    for (const char* key : {"HKEY_LOCAL_MACHINE\\SOFTWARE\\Tovimar\\Microsoft Access",
                            "HKEY_LOCAL_MACHINE\\SOFTWARE\\NEROV\\HTML Tovimar\\Microsoft Access"}) {
        const std::string folder = environment.registry->Read(key, "InstallPath");
        if (!folder.empty())
            return WithTrailingBackslash(folder);
    }
    return WithTrailingBackslash(environment.folders.program);
}

std::string RedirectValue(const std::string& fileName) {
    auto& files = *Env().files;
    const std::string path = InstallationFolder() + "Redirect\\" + fileName;
    if (!files.FileExists(path))
        return {};
    std::string line = files.ReadFile(path);
    line.erase(std::min(line.find_first_of("\r\n"), line.size()));
    if (line.starts_with("\xEF\xBB\xBF"))
        line.erase(0, 3);
    line = text::Trim(line);
    return line.starts_with('/') ? files.FromNative(line) : line;
}

std::string SettingsFolder() {
    return Redirected("Settings.rdt", InstallationFolder() + "Settings\\");
}

std::string ShippedSettingsFile() {
    return SettingsFolder() + ProductFile("Settings.xml");
}

std::string UserSettingsFile() {
    return platform::FolderOf(CataloguePath()) + ProductFile("Settings.xml");
}

std::string GlobalSettingsFile() {
    const std::string own = UserSettingsFile();
    return Env().files->FileExists(own) ? own : ShippedSettingsFile();
}

std::string WizardDefinitionFile() {
    return SettingsFolder() + ProductFile("WizardDef.xml");
}

std::string CataloguePath() {
    return WithTrailingBackslash(Env().folders.applicationData) + kProductFolder +
           ProductFile("Projects.xml");
}

std::string LogFolder() {
    return Redirected("Log.rdt", Env().folders.program);
}

std::string PassingFolder() {
    const auto& folders = Env().folders;
    return WithTrailingBackslash(folders.passing.empty() ? folders.temporary : folders.passing);
}

std::string TemporaryFolder() {
    return WithTrailingBackslash(Env().folders.temporary);
}

std::string OwnHelpFile() {
    return WithTrailingBackslash(Env().folders.program) + ProductFile(".chm");
}

std::string TemplatesFolder() {
    return Redirected("Templates.rdt", InstallationFolder() + "Templates\\");
}

std::string CommonTemplatesFolder() {
    return TemplatesFolder() + "Common\\";
}

std::string ParameterizedTemplatesFolder() {
    return TemplatesFolder() + "Parameterized\\";
}

std::string LocalizedTemplatesFolder() {
    IRunContext& context = Session::Context();
    for (const std::string& language : {context.Language(), context.LanguageCode()}) {
        const std::string folder = LanguageFolder(language);
        if (!folder.empty())
            return folder;
    }
    return TemplatesFolder() + "Localized\\EN\\";
}

std::string MessageFile() {
    return LocalizedFile("Messages.xml");
}

std::string CommonFile(const std::string& name) {
    return CommonTemplatesFolder() + FileNameOf(name);
}

std::string ParameterizedFile(const std::string& name) {
    return ParameterizedTemplatesFolder() + FileNameOf(name);
}

std::string LocalizedFile(const std::string& name) {
    return LocalizedTemplatesFolder() + FileNameOf(name);
}

std::string FindTemplate(const std::string& name) {
    auto& files = *Env().files;
    std::string path = ParameterizedFile(name);
    if (files.FileExists(path))
        return path;
    path = LocalizedFile(name);
    return files.FileExists(path) ? path : CommonFile(name);
}

std::string DefaultStyleSheetFile() {
    return CommonFile("Office10.css");
}

std::string DefaultTopicTemplate() {
    return ParameterizedFile("Default.htm");
}

std::string ContentsPageTemplate() {
    return ParameterizedFile("Contents.htm");
}

std::string NoHtmlPageTemplate() {
    return ParameterizedFile("NoHTML.htm");
}

} // namespace tovimar
