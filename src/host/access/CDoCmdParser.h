#pragma once

#include "platform/Error.h"

#include <string>

namespace tovimar {

/// Reads one line of code that calls a command of the host, such as `DoCmd.OpenForm "Orders", acNormal` or
/// `DoCmd.Close ObjectName:="Orders", ObjectType:=acForm`.
class CDoCmdParser {
public:
    /// 0 for a line that it knows, 0x8003FE07 for any other.
    ResultCode Parse(const std::string& vstrCodeLine);

    const std::string& ActionName() const { return actionName_; }
    /// "Form", "Table", "macro", ...; empty when the action or its argument tells none.
    const std::string& ObjTypeName() const { return objTypeName_; }
    std::string ObjTypeCode() const { return "ac" + objTypeName_; }
    const std::string& ObjName() const { return objName_; }
    /// False for a name that the code computes or keeps in a variable.
    bool ObjNameIsQuoted() const { return objNameIsQuoted_; }
    /// First part of the message code: "DoCmd.Open", "DoCmd.Close", "DoCmd.Save", "DoCmd.Run",
    /// "DoCmd.PrintOut".
    const std::string& MsgCode() const { return msgCode_; }

    std::string DebugPrintStr() const;
    /// Writes that text to the trace log.
    void DebugPrint() const;

private:
    std::string actionName_;
    std::string objTypeName_;
    std::string objName_;
    bool objNameIsQuoted_ = false;
    std::string msgCode_;
};

} // namespace tovimar
