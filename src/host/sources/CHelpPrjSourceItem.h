#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

/// One object of a source project.
class CHelpPrjSourceItem {
public:
    /// An object of the host: `SubType` is "Form", "Report", "Table", "Query" or "Macro".
    void InitFromHost(const std::string& vstrProjectName, const std::string& vstrFormName,
                      const std::string& vstrFormCaption, const std::string& vstrSubType);
    void Terminate();

    /// Code of `SubType`, 0 for an unknown one.
    std::int32_t ObjType() const;
    /// The name as file names use it.
    std::string FormNameNormalized() const;

    std::string ProjectName;
    /// An item of a project file of a development tool.
    bool IsVSProjectItem = false;
    std::string SubType;
    std::string FormName;
    /// May be empty.
    std::string FormCaption;
    /// Used inside another object, so it gets no topic of its own.
    bool Skipped = false;
};

} // namespace tovimar
