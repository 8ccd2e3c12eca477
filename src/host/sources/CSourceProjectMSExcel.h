#pragma once

#include "host/sources/HostSourceProject.h"

namespace tovimar {

/// The workbook that the host has open: worksheets, charts and forms. Lists that a host doesn't give stay
/// empty.
class CSourceProjectMSExcel : public HostSourceProject {
public:
    CSourceProjectMSExcel();

private:
    std::vector<Pass> Passes(CTovimarServerAgent& agent) override;
};

} // namespace tovimar
