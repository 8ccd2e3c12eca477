#include "host/sources/CSourceProjectMSAccess.h"

#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/text/Text.h"

namespace tovimar {

CSourceProjectMSAccess::CSourceProjectMSAccess()
    : HostSourceProject("CSourceProjectMSAccess", SourceProjectKind::kMSAccess) {}

bool CSourceProjectMSAccess::IsPassedOver(CTovimarServerAgent& agent, const std::string& name) {
    if (!isServerClient_)
        isServerClient_ = agent.CurrentSourceProjectIsADPorADE();
    return *isServerClient_ && ((text::Length(name) > 3 && text::StartsWithIgnoringCase(name, "sys")) ||
                                text::EqualsIgnoringCase(name, "dtproperties"));
}

std::vector<HostSourceProject::Pass> CSourceProjectMSAccess::Passes(CTovimarServerAgent& agent) {
    const CTovimarParameters& parameters = *Session::Parameters();
    std::vector<Pass> passes;
    if (parameters.GenerateHelpForTables)
        passes.push_back(PlainPass(tables_, "Table", agent.GetSourceTablesList()));
    if (parameters.GenerateHelpForQueries)
        passes.push_back(PlainPass(queries_, "Query", agent.GetSourceQueriesList()));
    if (parameters.GenerateHelpForMacros)
        passes.push_back(PlainPass(macros_, "Macro", agent.GetSourceMacrosList()));
    if (parameters.GenerateHelpForForms)
        passes.push_back({forms_, "Form", agent.GetSourceFormsList(), "Loading forms...", "Processing form [",
                          "]...", "Source Form skipped ", /*readsDesign=*/true, "Form", "~f_",
                          ObjectType::kForm});
    if (parameters.GenerateHelpForReports)
        passes.push_back({reports_, "Report", agent.GetSourceReportsList(), "Loading reports...",
                          "Processing report ", "...", "Source report skipped ", /*readsDesign=*/true,
                          "Report", "~r_", ObjectType::kReport});
    return passes;
}

} // namespace tovimar
