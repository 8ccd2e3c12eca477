#include "editor/CHtmlStringBuilder.h"

namespace tovimar {

namespace {

constexpr std::string_view kCrLf = "\r\n";

std::string_view Trimmed(std::string_view line) {
    const std::size_t begin = line.find_first_not_of(" \t\r\f");
    return begin == std::string_view::npos ? std::string_view()
                                           : line.substr(begin, line.find_last_not_of(" \t\r\f") + 1 - begin);
}

} // namespace

void CHtmlStringBuilder::Init(std::size_t vlngInitBufSize, std::size_t vlngBufExt) {
    builder_ = CStringBuilder();
    builder_.ChunkSize = vlngBufExt == 0 ? vlngInitBufSize : vlngBufExt;
    builder_.Reserve(vlngInitBufSize);
}

void CHtmlStringBuilder::AddString(std::string_view vstr, bool vfAddCrLf) {
    if (vfAddCrLf && !IsEmpty())
        builder_.Append(kCrLf);
    builder_.Append(vstr);
}

bool CHtmlStringBuilder::EndsInSpace() const {
    const std::string& text = builder_.TheString();
    return !text.empty() && (text.back() == ' ' || text.back() == '\n');
}

void CHtmlStringBuilder::RemoveTrailingVbCrLf() {
    while (LastTokenIsCrLf())
        builder_.Truncate(kCrLf.size());
}

void CHtmlStringBuilder::RemoveTrailingBlank() {
    if (builder_.TheString().ends_with(' '))
        builder_.Truncate(1);
}

void CHtmlStringBuilder::formatString(std::string& rstr, std::string_view vstrPref) {
    std::string formatted;
    formatted.reserve(rstr.size());
    const std::string_view text = rstr;
    for (std::size_t begin = 0; begin <= text.size();) {
        const std::size_t end = text.find('\n', begin);
        const std::string_view line = Trimmed(text.substr(begin, end - begin));
        if (begin == 0)
            formatted.append(line);
        else if (!line.empty())
            formatted.append(kCrLf).append(vstrPref).append(line);
        if (end == std::string_view::npos)
            break;
        begin = end + 1;
    }
    rstr = std::move(formatted);
}

} // namespace tovimar
