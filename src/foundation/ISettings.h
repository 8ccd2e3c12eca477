#pragma once

#include "platform/Value.h"

#include <string>

namespace tovimar {

/// A flat list of options. A stored "true" or "false" reads as a Boolean, an absent option as "".
class ISettings {
public:
    virtual ~ISettings() = default;
    virtual Value OptionValue(const std::string& vstrOptionName) = 0;
    virtual void SetOptionValue(const std::string& vstrOptionName, const Value& value) = 0;
};

/// Knows what the options mean: takes them over into the run's parameters and back.
class ISettingsLoadSave {
public:
    virtual ~ISettingsLoadSave() = default;
    virtual void Load(ISettings& rISettings, bool vfLoadFromProjectFile) = 0;
    virtual void Save(ISettings& rISettings) = 0;
};

} // namespace tovimar
