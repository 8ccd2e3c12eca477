#pragma once

#include "platform/AutomationObject.h"
#include "platform/Error.h"

#include <memory>

namespace tovimar {

class CTovimarClientAgent;

/// What a program holds to use the system on an application: connect, work through the session, disconnect.
class CTovimarClient {
public:
    CTovimarClient();
    ~CTovimarClient();

    /// 0 when connected. A connection that stands is ended first.
    ResultCode Connect(HostObject robjApp);
    void Disconnect();

private:
    std::unique_ptr<CTovimarClientAgent> agent_;
};

} // namespace tovimar
