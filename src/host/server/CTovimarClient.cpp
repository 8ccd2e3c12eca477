#include "host/server/CTovimarClient.h"

#include "host/server/CTovimarClientAgent.h"

namespace tovimar {

CTovimarClient::CTovimarClient() = default;

CTovimarClient::~CTovimarClient() = default;

ResultCode CTovimarClient::Connect(HostObject robjApp) {
    Disconnect();
    agent_ = std::make_unique<CTovimarClientAgent>();
    const ResultCode failure = agent_->Connect(std::move(robjApp));
    if (failure != kSuccess)
        agent_.reset();
    return failure;
}

void CTovimarClient::Disconnect() {
    if (agent_)
        agent_->Disconnect();
    agent_.reset();
}

} // namespace tovimar
