#include "host/server/CTovimarServer.h"

#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarActions.h"
#include "generation/HelpUtilities.h"
#include "host/server/CRequestQueue.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "host/server/CXmlCommand.h"
#include "host/server/IHelpEditorForm.h"
#include "platform/Environment.h"
#include "project/ComponentFileName.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarServer";

std::unique_ptr<CTovimarServer>& ProcessServer() {
    static std::unique_ptr<CTovimarServer> server;
    return server;
}

/// Where the help compiler can be had; the address is the installation's to say.
void OpenCompilerDownloadPage() {
    const std::string address = platform::Env().registry->Read(
        "HKEY_LOCAL_MACHINE\\SOFTWARE\\Tovimar\\Microsoft Access", "HtmlHelpWorkshopAddress");
    if (!address.empty())
        platform::Env().processes->Open(address);
}

} // namespace

CTovimarServer::CTovimarServer() = default;

CTovimarServer::~CTovimarServer() {
    Disconnect();
}

void CTovimarServer::Connect() {
    if (Session::Server() == nullptr)
        Session::SetServer(this);
    if (!data_) {
        data_ = std::make_unique<CTovimarServerData>();
        Session::SetServerData(data_.get());
        Session::SetContext(data_.get());
    }
    if (!agent_)
        agent_ = std::make_unique<CTovimarServerAgent>(*this);
    Session::SetServerAgent(agent_.get());
    data_->Generator();
    if (!actions_) {
        actions_ = std::make_unique<CTovimarActions>();
        actions_->Init();
    }
}

void CTovimarServer::Disconnect() {
    if (data_)
        data_->Release();
    if (Session::ServerData() == data_.get()) {
        Session::SetServerData(nullptr);
        Session::SetContext(nullptr);
    }
    if (Session::ServerAgent() == agent_.get())
        Session::SetServerAgent(nullptr);
    if (Session::Server() == this)
        Session::SetServer(nullptr);
    data_.reset();
    queue_.reset();
    if (actions_)
        actions_->Terminate();
    actions_.reset();
    helpEditor_.reset();
    agent_.reset();
    compilerTestDone_ = false;
    htmlWorkshopInstalled_ = false;
}

CTovimarActions& CTovimarServer::Actions() {
    constexpr ResultCode kNoObject = 91;
    if (actions_)
        return *actions_;
    throw RaisedError(kNoObject, "No server is connected", "CTovimarServer.Actions");
}

std::string CTovimarServer::SendCommand(const std::string& vstrCommand) {
    const bool interrupted = Session::Run().generationInterrupted;
    const bool verbose = Session::Context().VerboseTracing();
    if (verbose)
        WriteTraceLogMessage("CMD+ > " + vstrCommand);
    CheckErrorLimit();

    std::string answer;
    if (interrupted) {
        CXmlCommand command;
        command.Deserialize(vstrCommand).AddParamValue("RetValue", "0");
        answer = command.Serialize();
    } else if (TovimarClientCallBack) {
        answer = TovimarClientCallBack(vstrCommand);
    }
    if (verbose)
        WriteTraceLogMessage("CMD- > " + answer + ", interrupted = " + (interrupted ? "True" : "False"));
    return answer;
}

std::string CTovimarServer::GetComponentFileName(const std::string& vstrObjName,
                                                 const std::string& vstrCtlName,
                                                 const std::string& vstrPredefinedFileName) {
    return tovimar::GetComponentFileName(vstrObjName, vstrCtlName, vstrPredefinedFileName);
}

// Whatever the type, the prefix is that of forms.
std::string CTovimarServer::GetComponentFileNameWithPrefix(std::int32_t, const std::string& vstrObjName,
                                                           const std::string& vstrCtlName,
                                                           const std::string& vstrPredefinedFileName) {
    const std::string prefix = agent_ ? agent_->FormNamePrefix() : std::string();
    return GetComponentFileName(prefix + vstrObjName, vstrCtlName, vstrPredefinedFileName);
}

std::int32_t CTovimarServer::TestThatHtmlWorkshopInstalled() {
    constexpr std::int32_t kGoOn = 1;
    if (compilerTestDone_)
        return kGoOn;
    if (!GetHtmlHelpWorkshopExePath().empty()) {
        htmlWorkshopInstalled_ = true;
        return kGoOn;
    }
    const int answer = ShowMessage(
        "MS Html Help Workshop not found on this computer. Without it generated HTML help can't be "
        "compiled. Would you like to download and install it?\r\n\r\n"
        "Note: If you are certain that HTML Help Workshop is already installed press 'No' to "
        "continue.",
        kMsgYesNoCancel, kApplicationTitle);
    compilerTestDone_ = true;
    if (answer == platform::kAnswerYes)
        OpenCompilerDownloadPage();
    return answer == platform::kAnswerNo ? kGoOn : answer;
}

void CTovimarServer::RuntimeErrorMessage(ResultCode ErrNum, std::int32_t ErrLine,
                                         const std::string& ErrSource, const std::string& ErrDescription) {
    rErrorMessage(ErrNum, ErrLine, ErrDescription, {}, ErrSource, {}, /*reportFlag=*/true);
}

void CTovimarServer::WriteTraceLogMessage(const std::string& vstrMessage) {
    Trapped(kClass, "WriteTraceLogMessage", [&] {
        if (data_)
            data_->TraceLog().addMessage(vstrMessage);
    });
}

CTovimarServer& TheServer() {
    if (CTovimarServer* server = Session::Server())
        return *server;
    if (!ProcessServer())
        ProcessServer() = std::make_unique<CTovimarServer>();
    return *ProcessServer();
}

void ForgetServer() {
    ProcessServer().reset();
}

} // namespace tovimar
