#pragma once

#include <string>

namespace tovimar {

class CAddInProject;

/// The help compiler's command line for a project file: both in double quotes, one blank between.
std::string HelpCompilerCommandLine(const std::string& projectFile);
/// Runs it and waits; what it printed and its exit code stand in the generator afterwards. Raises 0x80040001
/// when it can't be started. Ended in its work by the user, it leaves no help file that is cut off.
void RunHelpCompiler(const std::string& commandLine, const CAddInProject& project);
/// Where the compiled help is copied to, with a trailing backslash: beside the source project, unless the
/// parameters name another folder.
std::string FolderOfCopiedHelp();
/// Copies a file where it isn't the target itself.
void CopyOver(const std::string& file, const std::string& target);

} // namespace tovimar
