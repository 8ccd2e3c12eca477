#pragma once

#include "platform/AutomationObject.h"

namespace tovimar {

/// Offered by a host context that can hold the object which a screenshot taken at run time refers to.
class IHostRuntimeContext {
public:
    virtual ~IHostRuntimeContext() = default;

    virtual void SetCurrentObject(HostObject robjCurrentObject) = 0;
    virtual HostObject CurrentObject() = 0;
};

} // namespace tovimar
