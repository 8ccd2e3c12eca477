#pragma once

#include "platform/Error.h"
#include "platform/KeyedList.h"

#include <array>
#include <string>
#include <vector>

namespace tovimar {

/// Texts by code from "Messages.xml". A message marked as parameter also replaces its code wherever that
/// stands in a page.
class CXmlMessages {
public:
    /// Text by code.
    const KeyedList<std::string>& Messages() const { return messages_; }
    /// Empty for an unknown code.
    std::string GetMessage(const std::string& vstrMsgCode) const;
    /// "{1}", "{2}", ... replaced by the parameters in order; a number without a parameter stays.
    std::string GetMessageWithParams(const std::string& vstrMsgCode,
                                     const std::vector<std::string>& parameters) const;
    /// Drops everything, then loads.
    ResultCode Reload(const std::string& vstrXmlFileFullPath);
    /// Adds the file's messages; of two with one code the first counts. 0, or the parser's code, which is
    /// reported.
    ResultCode Load(const std::string& vstrXmlFileFullPath);
    /// Every parameter name in the text becomes its message, without regard to case; the parameter
    /// "Copyright" goes first, then file order. Runs over every page: one pass as long as no name holds
    /// another.
    std::string ReplaceParameters(const std::string& vstr) const;

private:
    struct Parameter {
        std::string name;
        std::string text;
        /// `text` with the parameters behind this one replaced.
        std::string expanded;
    };

    void ReadFile(const std::string& path);
    void PrepareParameters();
    std::string ReplaceInOnePass(const std::string& text) const;
    const Parameter* ParameterAt(const std::string& text, std::size_t position) const;

    KeyedList<std::string> messages_;
    std::vector<Parameter> parameters_;
    /// Positions in parameters_ by the first byte of the name, lower case.
    std::array<std::vector<std::size_t>, 256> byFirstByte_;
    bool onePass_ = true;
};

} // namespace tovimar
