#include "host/sources/CSourceProjectMSExcel.h"

#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"

namespace tovimar {

CSourceProjectMSExcel::CSourceProjectMSExcel()
    : HostSourceProject("CSourceProjectMSExcel", SourceProjectKind::kMSExcel) {}

std::vector<HostSourceProject::Pass> CSourceProjectMSExcel::Passes(CTovimarServerAgent& agent) {
    std::vector<Pass> passes;
    passes.push_back(PlainPass(worksheets_, "Worksheet", agent.GetSourceWorksheetsList()));
    passes.push_back(PlainPass(charts_, "Chart", agent.GetSourceChartsList()));
    if (Session::Parameters()->GenerateHelpForForms)
        passes.push_back({forms_, "Form", agent.GetSourceFormsList(), "Loading forms...", "Processing form [",
                          "]...", "Source Form skipped ", /*readsDesign=*/true, "", "~f_",
                          ObjectType::kForm});
    return passes;
}

} // namespace tovimar
