#pragma once

#include "platform/AutomationObject.h"
#include "platform/Error.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// What a host offers to the core: connection, a few questions about the source project, and the one
/// road for everything else, `ProcessCallBack`. Paths are Windows paths.
class IHostIDEContext {
public:
    virtual ~IHostIDEContext() = default;

    /// Called once, before anything else, with the host's application object.
    virtual ResultCode Connect(HostObject robjHostIDE) = 0;
    /// Called once at the end. Without a connection it does nothing.
    virtual ResultCode Disconnect() = 0;
    /// A command text in, the same command with its answer out (`CXmlCommand`). Nothing escapes: a failure
    /// is reported and leaves the answer without a result.
    virtual std::string ProcessCallBack(const std::string& vstrXmlCommand) = 0;

    /// Null on hosts without project items.
    virtual HostObject GetCurrentProjectItemByName(const std::string& vstrItemName) = 0;
    /// Null when no source project is open.
    virtual HostObject CurrentProject() = 0;
    virtual HostObject IDE() = 0;
    virtual bool IDEDisplayModelIsMDI() = 0;
    virtual bool UseProjectGroupAsSource() = 0;
    virtual void SetUseProjectGroupAsSource(bool vfUse) = 0;
    /// Names of the open source projects with "|" between them; empty when none is open.
    virtual std::string SourceProjectsList() = 0;
    virtual void SetCurrentSourceProject(const std::string& vstrProjectName) = 0;
    virtual bool AreThereAnySourceProjectsOpened() = 0;
    virtual std::string CurrentSourceProjectFullPath() = 0;
    /// Without the file extension.
    virtual std::string CurrentSourceProjectName() = 0;
    /// One of `SourceProjectKind`.
    virtual std::string CurrentSourceProjectTypeName() = 0;
    virtual bool CurrentSourceProjectIsDirty() = 0;
    /// With a trailing backslash.
    virtual std::string CurrentSourceProjectLocation() = 0;
    /// The project is compiled: its objects can't be opened in design view.
    virtual bool CurrentSourceProjectIsMDEorADE() = 0;
    /// The project is a client of a database server.
    virtual bool CurrentSourceProjectIsADPorADE() = 0;
    /// Owner of dialogs and pictures.
    virtual std::int32_t HostAppMainWindowHWnd() = 0;
    virtual void HideIDEWindows() = 0;
    virtual void ResetIDEWindows() = 0;
    virtual std::string CurrentObjectName() = 0;
    virtual std::int32_t CurrentObjectType() = 0;
    virtual bool CurrentSourceProjectIsNewUnsaved() = 0;
    virtual bool CurrentSourceProjectCodeIsDisabled() = 0;
};

} // namespace tovimar
