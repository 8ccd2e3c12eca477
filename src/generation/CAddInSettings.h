#pragma once

#include "foundation/ISettings.h"

#include <string>
#include <vector>

namespace tovimar {

/// Knows what the options mean: takes them from the option store into the run's parameters, and back. A bad
/// value in one option leaves that parameter as it was.
class CAddInSettings : public ISettingsLoadSave {
public:
    /// Name, title and application are taken from a project's own file only, where they aren't empty.
    void Load(ISettings& rISettings, bool vfLoadFromProjectFile) override;
    void Save(ISettings& rISettings) override;
};

/// Makes every settings file load through `CAddInSettings`; once, at program start.
void RegisterSettingsLoader();

/// An option as a person sets it.
struct OptionDescription {
    const char* name;
    const char* meaning;
    /// "true|false", the words or numbers that are allowed, or empty for any text.
    const char* values;
    /// Read from a project file only; no default in the settings file.
    bool ofProject = false;
};
/// Every option, in the order in which they load.
const std::vector<OptionDescription>& OptionDescriptions();

} // namespace tovimar
