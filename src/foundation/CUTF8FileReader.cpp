#include "foundation/CUTF8FileReader.h"

#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

constexpr std::string_view kUtf8Header = "\xEF\xBB\xBF";
/// A mark counts within this many characters from the start.
constexpr std::size_t kMarkReach = 2048;

} // namespace

bool HasUtf8Mark(const std::string& text) {
    return text::ContainsIgnoringCase(text, "content=\"text/html; charset=utf-8\"") ||
           text::ContainsIgnoringCase(text, "encoding=\"utf-8\"");
}

void CUTF8FileReader::Dispose() {
    *this = {};
}

ResultCode CUTF8FileReader::LoadFile(const std::string& vstrFileFullPath) {
    Dispose();
    if (vstrFileFullPath.empty())
        return kGeneralFailure;
    return Trapped(
        "CUTF8FileReader", "LoadFile", [&] { Read(vstrFileFullPath); },
        [&] { return "File = " + vstrFileFullPath; });
}

void CUTF8FileReader::Read(const std::string& path) {
    std::string bytes = platform::Env().files->ReadFile(path);
    length_ = static_cast<std::int32_t>(bytes.size());
    hasHeader_ = bytes.starts_with(kUtf8Header);
    isUtf8_ = hasHeader_ || HasUtf8Mark(bytes.substr(0, kMarkReach));
    if (hasHeader_)
        bytes.erase(0, kUtf8Header.size());
    text_ = isUtf8_ ? text::MakeValidUtf8(bytes) : text::AnsiCodePage().Decode(bytes);
}

} // namespace tovimar
