#pragma once

#include "platform/AutomationObject.h"

#include <cstdint>
#include <string>

namespace tovimar {

class CTovimarServer;

/// The way of a second component in the process to the server.
class CTovimarServerProxy {
public:
    /// An empty name is the system's own.
    void Connect(HostObject mobjApp, const std::string& vstrProductName = {});
    /// Nothing is let go: the server belongs to its client.
    void Disconnect(std::int32_t RemoveMode, HostObject custom);
    /// The process's server, made when there is none.
    CTovimarServer& TovimarServerObject() const;
    const std::string& ProductName() const { return productName_; }

private:
    std::string productName_;
};

} // namespace tovimar
