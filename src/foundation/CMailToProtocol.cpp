#include "foundation/CMailToProtocol.h"

#include "platform/Environment.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

/// What mail programs and shells take at most, in characters.
constexpr std::size_t kMaxAddress = 2000;
constexpr std::string_view kLineEnd = "%0d%0a";

std::string Escape(const std::string& text) {
    return text::ReplaceAll(text::ReplaceAll(text, "\r\n", kLineEnd), " ", "%20");
}

std::string Truncate(const std::string& address) {
    std::string cut = text::Left(address, kMaxAddress);
    const auto lineEnd = cut.rfind(kLineEnd);
    if (lineEnd != std::string::npos)
        cut.erase(lineEnd + kLineEnd.size());
    return cut + "...";
}

} // namespace

std::string CMailToProtocol::Address(const std::string& vstrAddrTo, const std::string& vstrSubject,
                                     const std::string& vstrBodyText, const std::string& vstrAddrCC,
                                     const std::string& vstrAddrBCC, bool vfTruncate) {
    std::string address = "mailto:" + vstrAddrTo + "?";
    if (!vstrAddrCC.empty())
        address += "CC=" + vstrAddrCC + "&";
    if (!vstrAddrBCC.empty())
        address += "BCC=" + vstrAddrBCC + "&";
    address += "Subject=" + Escape(vstrSubject) + "&Body=" + Escape(vstrBodyText);
    return vfTruncate && text::Length(address) > kMaxAddress ? Truncate(address) : address;
}

ResultCode CMailToProtocol::Send(const std::string& vstrAddrTo, const std::string& vstrSubject,
                                 const std::string& vstrBodyText, const std::string& vstrAddrCC,
                                 const std::string& vstrAddrBCC, bool vfTruncate) {
    const std::string address =
        Address(vstrAddrTo, vstrSubject, vstrBodyText, vstrAddrCC, vstrAddrBCC, vfTruncate);
    return platform::Env().processes->Open(address) ? kSuccess : kGeneralFailure;
}

} // namespace tovimar
