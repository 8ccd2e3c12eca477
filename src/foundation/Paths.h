#pragma once

#include <string>

/// Where every file of the system is: from the registry, from redirect files (`Redirect\*.rdt` below the
/// installation folder: one path in the first line) and from the running program's folder. All results are
/// Windows paths; folders end in a backslash.
namespace tovimar {

/// Value "InstallPath" of the registry, else the program's folder.
std::string InstallationFolder();
std::string SettingsFolder();
/// "vasmoraSettings.xml" of the settings folder, as it was installed. Nothing writes it: an installation
/// belongs to all users of a machine.
std::string ShippedSettingsFile();
/// The user's own one, in the folder of the catalogue; where settings are saved.
std::string UserSettingsFile();
/// The settings in force: the user's own file once it is there, else the shipped one.
std::string GlobalSettingsFile();
std::string WizardDefinitionFile();
/// "vasmoraProjects.xml" of the user's application data.
std::string CataloguePath();
std::string LogFolder();
std::string TemporaryFolder();
/// Where a file goes that is read back and deleted at once.
std::string PassingFolder();
/// "vasmora.chm" in the program's folder: the help of the system itself.
std::string OwnHelpFile();

/// Root of the template folders.
std::string TemplatesFolder();
std::string CommonTemplatesFolder();
std::string ParameterizedTemplatesFolder();
/// The folder of the run's language when it has a "Welcome.htm", else `Localized\EN\`.
std::string LocalizedTemplatesFolder();
/// "Messages.xml" of the localized folder.
std::string MessageFile();

/// Template look-up. Each takes a name or path and uses its file name only.
std::string CommonFile(const std::string& name);
std::string ParameterizedFile(const std::string& name);
std::string LocalizedFile(const std::string& name);
/// The parameterized file if it exists, else the localized one if it exists, else the common one, whether
/// it exists or not.
std::string FindTemplate(const std::string& name);
std::string DefaultStyleSheetFile();
std::string DefaultTopicTemplate();
std::string ContentsPageTemplate();
std::string NoHtmlPageTemplate();

/// First line of a redirect file, trimmed; empty without one.
std::string RedirectValue(const std::string& fileName);

} // namespace tovimar
