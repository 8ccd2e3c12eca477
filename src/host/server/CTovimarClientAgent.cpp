#include "host/server/CTovimarClientAgent.h"

#include "host/access/CN_IDEAccContext.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"

namespace tovimar {

CTovimarClientAgent::CTovimarClientAgent() = default;

CTovimarClientAgent::~CTovimarClientAgent() {
    Disconnect();
}

ResultCode CTovimarClientAgent::Connect(HostObject robjApp) {
    auto context = std::make_unique<CN_IDEAccContext>();
    if (const ResultCode failure = context->Connect(robjApp); failure != kSuccess)
        return failure;
    context_ = std::move(context);
    CTovimarServer& server = TheServer();
    server.TovimarClientCallBack = [this](const std::string& command) {
        return context_->ProcessCallBack(command);
    };
    server.Connect();
    server.ServerData()->IDEAppInstance = std::move(robjApp);
    return kSuccess;
}

void CTovimarClientAgent::Disconnect() {
    if (!context_)
        return;
    CTovimarServer& server = TheServer();
    server.CloseFormsOnDisconnection();
    context_->Disconnect();
    server.Disconnect();
    server.TovimarClientCallBack = nullptr;
    context_.reset();
    ForgetServer();
}

} // namespace tovimar
