#pragma once

#include "host/sources/HostSourceProject.h"

#include <optional>

namespace tovimar {

/// The database that the host has open. Captions of forms and reports, and which of them are shown inside
/// others, are taken from text copies of their designs.
class CSourceProjectMSAccess : public HostSourceProject {
public:
    CSourceProjectMSAccess();

private:
    std::vector<Pass> Passes(CTovimarServerAgent& agent) override;
    /// System tables of a client of a database server.
    bool IsPassedOver(CTovimarServerAgent& agent, const std::string& name) override;

    std::optional<bool> isServerClient_;
};

} // namespace tovimar
