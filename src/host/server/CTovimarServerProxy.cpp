#include "host/server/CTovimarServerProxy.h"

#include "foundation/Product.h"
#include "host/server/CTovimarServer.h"

namespace tovimar {

void CTovimarServerProxy::Connect(HostObject /*mobjApp*/, const std::string& vstrProductName) {
    productName_ = vstrProductName.empty() ? kProductName : vstrProductName;
}

void CTovimarServerProxy::Disconnect(std::int32_t /*RemoveMode*/, HostObject /*custom*/) {}

CTovimarServer& CTovimarServerProxy::TovimarServerObject() const {
    return TheServer();
}

} // namespace tovimar
