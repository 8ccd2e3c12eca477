#pragma once

#include "platform/AutomationObject.h"
#include "platform/Error.h"

#include <memory>

namespace tovimar {

class IHostIDEContext;

/// Joins a host's context and the server: every command of the server goes to the context.
class CTovimarClientAgent {
public:
    CTovimarClientAgent();
    ~CTovimarClientAgent();

    /// The status of the context's `Connect`.
    ResultCode Connect(HostObject robjApp);
    void Disconnect();

private:
    std::unique_ptr<IHostIDEContext> context_;
};

} // namespace tovimar
