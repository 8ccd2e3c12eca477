#include "foundation/CUTF8FileWriter.h"

#include "foundation/CUTF8FileReader.h"
#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

bool LooksLikeHtml(const std::string& text) {
    return text::ContainsIgnoringCase(text, "<html") || text::ContainsIgnoringCase(text, "<param");
}

/// The text with every character that the page can't hold as `&#n;`.
std::string WithReferences(const std::string& text, const text::CodePage& page) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size();) {
        const std::size_t start = i;
        const char32_t codePoint = text::NextCodePoint(text, i);
        if (page.CanEncode(codePoint))
            out.append(text, start, i - start);
        else
            out += "&#" + std::to_string(static_cast<std::uint32_t>(codePoint)) + ";";
    }
    return out;
}

std::string BytesOf(const std::string& text, bool addHeader, bool plainUnlessMarked) {
    if (plainUnlessMarked && !HasUtf8Mark(text))
        return EncodePlainText(text);
    return (addHeader ? "\xEF\xBB\xBF" : "") + text::MakeValidUtf8(text);
}

} // namespace

std::string EncodePlainText(std::string text) {
    if (text::IsAscii(text))
        return text;
    const text::CodePage& page = text::AnsiCodePage();
    return page.Encode(LooksLikeHtml(text) ? WithReferences(text, page) : text);
}

ResultCode CUTF8FileWriter::SaveFile(const std::string& vstrFileFullPath, const std::string& vstrText,
                                     bool vfAddUTF8FileHeader, bool vfSaveAsUsualTextFileIfNotUTF8,
                                     Durability durability) {
    if (vstrFileFullPath.empty())
        return kGeneralFailure;
    const std::string& text = vstrText.empty() ? text_ : vstrText;
    auto& files = *platform::Env().files;
    return Trapped(
        "CUTF8FileWriter", "SaveFile",
        [&] {
            const std::string bytes = BytesOf(text, vfAddUTF8FileHeader, vfSaveAsUsualTextFileIfNotUTF8);
            if (durability == Durability::OnDisk)
                files.WriteFileToDisk(vstrFileFullPath, bytes);
            else
                files.WriteFile(vstrFileFullPath, bytes);
        },
        [&] {
            return "File = " + vstrFileFullPath +
                   "\r\nREAD_ONLY = " + (files.IsReadOnly(vstrFileFullPath) ? "True" : "False");
        });
}

} // namespace tovimar
