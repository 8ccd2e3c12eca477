#pragma once

#include <string>

/// Showing the help of the current project, after asking whether to make it again when it is older than what
/// it was made from. Failures are reported under "modTovimarUtils".
namespace tovimar {

/// The compiled help in the help viewer. Warns when there is none.
void OpenHelp(bool vfSkipStaleCheck);
/// The entry page of the web help in the desktop's browser. Warns when there is none.
void OpenWebHelp(bool vfSkipStaleCheck);

/// True when a file of the folder is later than the first compiled help in it; project files don't count,
/// every save touches them.
bool IsHelpStale(const std::string& vstrChmFullPath);
/// True when contents, index or project file beside the page are later than the page.
bool IsWebHelpStale(const std::string& vstrMainPageFullPath);

} // namespace tovimar
