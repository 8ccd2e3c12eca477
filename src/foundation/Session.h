#pragma once

#include "foundation/RunState.h"
#include "platform/Error.h"

#include <memory>
#include <string>

namespace tovimar {

class CTovimarServer;
class CTovimarServerData;
class CTovimarServerAgent;
class CTovimarParameters;
class CTovimar;
class CHelpPrjTree;
class CAddInProjects;
class CAddInProject;
class CTraceLog;
class CXmlMessages;
class CCodePages;
class CAddInSettingsXmlFile;
class LoadedForms;

/// What the foundation asks of the run above it. The server data implements it and registers itself;
/// without a run the session answers with these defaults.
class IRunContext {
public:
    virtual ~IRunContext() = default;
    /// Project tags replaced by the current parameters.
    virtual std::string ReplaceTags(const std::string& text) { return text; }
    virtual bool AutomatedTestModeOn() { return false; }
    virtual bool WizardUnattendedExecution() { return false; }
    virtual bool VerboseTracing() { return false; }
    /// Name of the localized template folder, such as "EN".
    virtual std::string Language() { return {}; }
    virtual std::string LanguageCode() { return {}; }
    virtual std::string HelpProjectTitle() { return {}; }
    /// Of the source project at hand, by the host; empty without one.
    virtual std::string CurrentSourceProjectFullPath() { return {}; }
    virtual std::string SourceProjectsList() { return {}; }
    /// Writes the tree into a project file, placeholders left out; nothing without a tree. 0, or the failure,
    /// which is reported.
    virtual ResultCode SaveTree(const std::string& /*path*/, const std::string& /*extraAttributes*/,
                                const std::string& /*picsSubfolderName*/) {
        return kSuccess;
    }
};

/// The process-wide accessors. Nothing passes these objects down; code asks here. All pointers are not
/// owned and null while there is no such object, but where a text says otherwise.
namespace Session {

RunState& Run();
IRunContext& Context();
/// Null puts the defaults back.
void SetContext(IRunContext* context);

/// The one server; null before a connection. host/server makes it on demand and registers it here.
CTovimarServer* Server();
void SetServer(CTovimarServer* server);
/// The server's shared data; null without a server.
CTovimarServerData* ServerData();
void SetServerData(CTovimarServerData* data);
/// The sender of commands to the host.
CTovimarServerAgent* ServerAgent();
void SetServerAgent(CTovimarServerAgent* agent);

/// The generator of this connection, its parameters and its tree.
CTovimar* Generator();
void SetGenerator(CTovimar* generator);
CTovimarParameters* Parameters();
void SetParameters(CTovimarParameters* parameters);
CHelpPrjTree* HelpProjectTree();
void SetHelpProjectTree(CHelpPrjTree* tree);

/// The project catalogue and its current project.
CAddInProjects* Projects();
void SetProjects(CAddInProjects* projects);
CAddInProject* CurrentProject();

/// Never null: an own log serves while no connection has set one.
CTraceLog* TraceLog();
void SetTraceLog(CTraceLog* log);
/// Never null: an empty table serves while none is loaded.
CXmlMessages* Messages();
void SetMessages(CXmlMessages* messages);
/// The forms of the process that are loaded.
LoadedForms& Forms();
CAddInSettingsXmlFile* Settings();
void SetSettings(CAddInSettingsXmlFile* settings);

} // namespace Session
} // namespace tovimar
