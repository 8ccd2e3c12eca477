#pragma once

#include "platform/Error.h"

#include <string>

namespace tovimar {

/// A new message in the user's mail program.
class CMailToProtocol {
public:
    /// 0, or kGeneralFailure when there is no mail program.
    ResultCode Send(const std::string& vstrAddrTo, const std::string& vstrSubject,
                    const std::string& vstrBodyText, const std::string& vstrAddrCC = {},
                    const std::string& vstrAddrBCC = {}, bool vfTruncate = false);

    /// The address that Send opens: blanks and line ends of subject and body escaped, nothing else. With
    /// `vfTruncate` at most 2000 characters, cut behind a whole line, and "...".
    static std::string Address(const std::string& vstrAddrTo, const std::string& vstrSubject,
                               const std::string& vstrBodyText, const std::string& vstrAddrCC,
                               const std::string& vstrAddrBCC, bool vfTruncate);
};

} // namespace tovimar
