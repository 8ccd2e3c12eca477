#include "project/WebHelpFiles.h"

#include "generation/HelpUtilities.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/SitemapText.h"
#include "topics/CFormHtmlTemplates.h"

#include <cstddef>

namespace tovimar {

std::string FillFileFromTemplate(const std::string& templatePath, const std::string& target,
                                 const std::vector<std::string>& tags) {
    return ReplaceTagsAndCopy(templatePath, target, tags);
}

void AddWebHelpScript(std::string& text) {
    if (!text::ContainsIgnoringCase(text, "wbh"))
        text += std::string(kCrLf) + kCrLf + WebHelpScript("main.htm");
}

// Pages are changed as bytes: the script is ASCII, so a page of any code page stays what it was.

void AddWebHelpScriptToFile(const std::string& path) {
    auto& files = *platform::Env().files;
    if (!files.FileExists(path))
        return;
    auto page = files.ReadFile(path);
    const auto length = page.size();
    AddWebHelpScript(page);
    if (page.size() != length)
        files.WriteFile(path, page);
}

bool RemoveWBHScript(const std::string& path) {
    static const std::string kEnd = "</html>";
    auto& files = *platform::Env().files;
    if (!files.FileExists(path))
        return false;
    const auto page = files.ReadFile(path);
    const auto end = text::FindIgnoringCase(page, kEnd);
    if (end == std::string::npos ||
        text::FindIgnoringCase(page, "<script", end + kEnd.size()) == std::string::npos)
        return false;
    // One character more: the line end's first half stays, the script comes back with its own.
    files.WriteFile(path, page.substr(0, end + kEnd.size() + 1));
    return true;
}

} // namespace tovimar
