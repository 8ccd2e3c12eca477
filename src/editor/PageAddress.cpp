#include "editor/PageAddress.h"

#include "platform/text/Text.h"

#include <array>
#include <cctype>
#include <utility>

namespace tovimar {

namespace {

std::string WithSlashes(std::string_view path) {
    return text::ReplaceAll(path, "\\", "/");
}

bool IsHexDigit(std::string_view text, std::size_t position) {
    return position < text.size() && std::isxdigit(static_cast<unsigned char>(text[position])) != 0;
}

/// "%25" becomes "%" where that makes no new escape.
std::string DecodePercents(const std::string& text) {
    constexpr std::string_view kPercent = "%25";
    std::string out;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const bool escape =
            text.compare(i, kPercent.size(), kPercent) == 0 &&
            !(IsHexDigit(text, i + kPercent.size()) && IsHexDigit(text, i + kPercent.size() + 1));
        out += text[i];
        if (escape)
            i += kPercent.size() - 1;
    }
    return out;
}

/// Without the prefix, which may be in another case.
std::string Behind(std::string_view text, const std::string& prefix) {
    return text::Mid(text, text::Length(prefix) + 1);
}

/// True when the address goes to the file itself: nothing, a place in it or a query follows the name.
bool GoesTo(std::string_view address, const std::string& fileName) {
    if (fileName.empty() || !text::StartsWithIgnoringCase(address, fileName))
        return false;
    const std::string rest = Behind(address, fileName);
    return rest.empty() || rest.front() == '#';
}

/// "&amp;" becomes "&", also where it was encoded again and again.
std::string DecodeAmpersands(const std::string& text) {
    constexpr std::string_view kName = "amp;";
    std::string out;
    std::size_t done = 0;
    for (std::size_t at = text.find('&'); at != std::string::npos; at = text.find('&', done)) {
        out.append(text, done, at + 1 - done);
        done = at + 1;
        while (text.compare(done, kName.size(), kName) == 0)
            done += kName.size();
    }
    return out.append(text, done);
}

} // namespace

std::string WithoutFileScheme(std::string_view address) {
    return text::ReplaceAllIgnoringCase(text::ReplaceAllIgnoringCase(address, "file:///", ""), "file://", "");
}

std::string DecodeUrl(std::string_view address) {
    static constexpr std::array<std::pair<const char*, const char*>, 8> kEscapes{{{"%20", " "},
                                                                                  {"%23", "#"},
                                                                                  {"%26", "&"},
                                                                                  {"%5E", "^"},
                                                                                  {"%5B", "["},
                                                                                  {"%5D", "]"},
                                                                                  {"%7B", "{"},
                                                                                  {"%7D", "}"}}};
    std::string decoded = WithSlashes(address);
    if (decoded.find('%') != std::string::npos) {
        for (const auto& [escape, character] : kEscapes)
            decoded = text::ReplaceAllIgnoringCase(decoded, escape, character);
        decoded = DecodePercents(decoded);
    }
    return DecodeAmpersands(decoded);
}

PageAddress PageAddress::Of(const std::string& url, const std::string& base) {
    PageAddress page;
    const std::string folder = WithSlashes(WithoutFileScheme(base.empty() ? url : base));
    // A folder without its drive or server could stand in the middle of any address.
    if (folder.find(':') != std::string::npos)
        page.BaseFolder = folder.substr(0, folder.rfind('/') + 1);
    const std::string file = WithSlashes(WithoutFileScheme(url));
    page.FileName = file.substr(file.rfind('/') + 1);
    return page;
}

std::string PageAddress::Relative(std::string_view address) const {
    std::string relative = WithSlashes(WithoutFileScheme(address));
    if (!BaseFolder.empty() && text::ContainsIgnoringCase(relative, BaseFolder)) {
        relative = text::ReplaceAllIgnoringCase(relative, BaseFolder, "");
        if (relative.starts_with('/'))
            relative.erase(0, 1);
        if (GoesTo(relative, FileName))
            relative = Behind(relative, FileName);
    }
    return DecodeUrl(relative);
}

std::string PageAddress::RelativeAsWritten(std::string_view address) const {
    std::string relative = WithoutFileScheme(address);
    if (!BaseFolder.empty() && text::StartsWithIgnoringCase(WithSlashes(relative), BaseFolder))
        relative = Behind(relative, BaseFolder);
    return relative.empty() ? relative : DecodeUrl(relative);
}

} // namespace tovimar
