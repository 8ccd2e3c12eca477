#include "foundation/Session.h"

#include "foundation/CAddInProjects.h"
#include "foundation/CTraceLog.h"
#include "foundation/CXmlMessages.h"
#include "foundation/LoadedForms.h"

namespace tovimar {
namespace {

struct State {
    RunState run;
    IRunContext defaultContext;
    IRunContext* context = nullptr;
    CTovimarServer* server = nullptr;
    CTovimarServerData* serverData = nullptr;
    CTovimarServerAgent* serverAgent = nullptr;
    CTovimar* generator = nullptr;
    CTovimarParameters* parameters = nullptr;
    CHelpPrjTree* tree = nullptr;
    CAddInProjects* projects = nullptr;
    CTraceLog* traceLog = nullptr;
    CXmlMessages* messages = nullptr;
    CAddInSettingsXmlFile* settings = nullptr;
    LoadedForms forms;
    // They serve while nobody has set any.
    CTraceLog ownTraceLog;
    CXmlMessages noMessages;
};

State& TheState() {
    static State state;
    return state;
}

} // namespace

void CheckErrorLimit() {
    RunState& run = Session::Run();
    if (run.generationInterrupted || run.runErrorCount < kErrorLimit)
        return;
    run.generationInterrupted = true;
    run.runErrorCount = 0;
}

namespace Session {

RunState& Run() {
    return TheState().run;
}

IRunContext& Context() {
    State& state = TheState();
    return state.context != nullptr ? *state.context : state.defaultContext;
}

void SetContext(IRunContext* context) {
    TheState().context = context;
}

CTovimarServer* Server() {
    return TheState().server;
}
void SetServer(CTovimarServer* server) {
    TheState().server = server;
}

CTovimarServerData* ServerData() {
    return TheState().serverData;
}
void SetServerData(CTovimarServerData* data) {
    TheState().serverData = data;
}

CTovimarServerAgent* ServerAgent() {
    return TheState().serverAgent;
}
void SetServerAgent(CTovimarServerAgent* agent) {
    TheState().serverAgent = agent;
}

CTovimar* Generator() {
    return TheState().generator;
}
void SetGenerator(CTovimar* generator) {
    TheState().generator = generator;
}

CTovimarParameters* Parameters() {
    return TheState().parameters;
}
void SetParameters(CTovimarParameters* parameters) {
    TheState().parameters = parameters;
}

CHelpPrjTree* HelpProjectTree() {
    return TheState().tree;
}
void SetHelpProjectTree(CHelpPrjTree* tree) {
    TheState().tree = tree;
}

CAddInProjects* Projects() {
    return TheState().projects;
}
void SetProjects(CAddInProjects* projects) {
    TheState().projects = projects;
}

CAddInProject* CurrentProject() {
    CAddInProjects* projects = Projects();
    return projects != nullptr ? projects->CurrentProject() : nullptr;
}

CTraceLog* TraceLog() {
    State& state = TheState();
    return state.traceLog != nullptr ? state.traceLog : &state.ownTraceLog;
}

void SetTraceLog(CTraceLog* log) {
    State& state = TheState();
    state.traceLog = log;
    // The own log asks for its folder anew, which may have changed with the environment.
    if (log == nullptr)
        state.ownTraceLog = CTraceLog();
}

CXmlMessages* Messages() {
    State& state = TheState();
    return state.messages != nullptr ? state.messages : &state.noMessages;
}

void SetMessages(CXmlMessages* messages) {
    TheState().messages = messages;
}

LoadedForms& Forms() {
    return TheState().forms;
}

CAddInSettingsXmlFile* Settings() {
    return TheState().settings;
}
void SetSettings(CAddInSettingsXmlFile* settings) {
    TheState().settings = settings;
}

} // namespace Session
} // namespace tovimar
