#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

namespace tovimar {

class CTovimarServerAgent;
class CTovimarServerData;

/// The one object through which the core reaches the host and the run's shared data. One per process.
class CTovimarServer {
public:
    CTovimarServer();
    ~CTovimarServer();
    CTovimarServer(const CTovimarServer&) = delete;
    CTovimarServer& operator=(const CTovimarServer&) = delete;

    /// Registers this server with its data and its agent in the session.
    void Connect();
    /// Lets go of the run's data, the generator first, and leaves the session.
    void Disconnect();

    /// Null while disconnected.
    CTovimarServerData* ServerData() const { return data_.get(); }
    CTovimarServerAgent* Agent() const { return agent_.get(); }

    /// Hands a command text to the host and gives the answer; a stopped run answers "0" itself.
    std::string SendCommand(const std::string& vstrCommand);
    /// Set by the connected client: command text in, answer out.
    std::function<std::string(const std::string&)> TovimarClientCallBack;

    /// Name of an object, or the predefined one, with "_" and a control's name behind it if there is one;
    /// fit for a file name. Without extension.
    std::string GetComponentFileName(const std::string& vstrObjName, const std::string& vstrCtlName = {},
                                     const std::string& vstrPredefinedFileName = {});
    std::string GetComponentFileNameWithPrefix(std::int32_t lngObjType, const std::string& vstrObjName,
                                               const std::string& vstrCtlName = {},
                                               const std::string& vstrPredefinedFileName = {});

    /// True once `TestThatHtmlWorkshopInstalled` has found the help compiler.
    bool HtmlWorkshopInstalled() const { return htmlWorkshopInstalled_; }
    /// 1 to go on, else the pressed button. Asks once per connection when the compiler is missing.
    std::int32_t TestThatHtmlWorkshopInstalled();

    void RuntimeErrorMessage(ResultCode ErrNum, std::int32_t ErrLine, const std::string& ErrSource,
                             const std::string& ErrDescription);
    void WriteTraceLogMessage(const std::string& vstrMessage);

private:
    std::unique_ptr<CTovimarServerData> data_;
    std::unique_ptr<CTovimarServerAgent> agent_;
    bool compilerTestDone_ = false;
    bool htmlWorkshopInstalled_ = false;
};

/// The process's server, made when there is none.
CTovimarServer& TheServer();
/// Forgets the server that `TheServer` made.
void ForgetServer();

} // namespace tovimar
