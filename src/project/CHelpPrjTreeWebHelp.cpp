#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "generation/FolderOperations.h"
#include "generation/HelpUtilities.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/BackupPages.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/SitemapText.h"
#include "project/WebHelpFiles.h"

#include <map>

/// The project folder as a web site.
namespace tovimar {

namespace {

constexpr ResultCode kNoSearchEngine = 30001;
constexpr std::int32_t kOptionIndent = 8;

void CopyCommonFiles(const std::string& folder) {
    const auto images = platform::Join(folder, "images\\");
    platform::Env().files->MakeFolders(images);
    CopyFilesByMask(CommonTemplatesFolder() + "images\\", images, "*.*");
    for (const char* pattern : {"*.js", "*.css"})
        CopyFilesByMask(CommonTemplatesFolder(), folder, pattern);
}

std::string SearchEngine() {
    auto& env = platform::Env();
    const auto installation = InstallationFolder();
    const auto program = platform::WithTrailingBackslash(env.folders.program);
    // The last is a package's place for it.
    for (const auto& path :
         {installation + "ss.exe", program + "tools\\ss.exe", program + "..\\lib\\tovimar\\ss.exe"})
        if (env.files->FileExists(path))
            return path;
    throw RaisedError(kNoSearchEngine, "Site search engine (ss.exe) not found in '" + installation + "'.",
                      "CHelpPrjTree.BuildSiteSearch");
}

/// Text between the line's first ">" and the next "<".
std::string OptionCaption(const std::string& line) {
    const auto start = line.find('>');
    if (start == std::string::npos)
        return {};
    const auto end = line.find('<', start);
    return line.substr(start + 1, end == std::string::npos ? end : end - start - 1);
}

struct IgnoringCase {
    bool operator()(const std::string& left, const std::string& right) const {
        return text::CompareIgnoringCase(left, right) < 0;
    }
};

/// The line that links to the search engine's own help.
std::string WithoutHelpLine(const std::string& page) {
    static const std::string kEnd = "Help</a> |\r\n";
    const auto start = text::FindIgnoringCase(page, "| <a href=");
    if (start == std::string::npos)
        return page;
    const auto end = text::FindIgnoringCase(page, kEnd, start);
    const auto lineEnd = page.find("\r\n", start);
    if (end == std::string::npos || lineEnd != end + kEnd.size() - 2)
        return page;
    return page.substr(0, start) + page.substr(end + kEnd.size());
}

} // namespace

ResultCode CHelpPrjTree::MakeJavaHelp(CAddInProject& robjPrj) {
    return Trapped("CHelpPrjTree", "MakeJavaHelp", [&] { MakeJavaHelp2(robjPrj); });
}

ResultCode CHelpPrjTree::MakeJavaHelp2(CAddInProject& robjPrj) {
    CopyCommonFiles(robjPrj.Folder);
    std::string options;
    const auto tree = GetTreeStr(options, /*vfForceContentsRebuild=*/true);
    LeaveIfInterrupted();
    SortIndexOptions(options, kOptionIndent);
    const auto* parameters = Session::Parameters();
    const auto styleSheet = parameters == nullptr ? std::string() : parameters->CSSFullPath();
    const auto charset = parameters == nullptr ? std::string() : parameters->Charset;
    const std::vector<std::string> tags = {
        "{{StyleSheetLinkHtml}}|" + GetStyleSheetLinkHtml(styleSheet),
        "{{charset}}|" + charset,
        "{{ProjectTree}}|" + tree,
        "{{Options}}|" + options,
        "{{rootpage}}|" + (root_ == nullptr ? std::string() : root_->GeneratedHTMLFile()),
    };
    FillFileFromTemplate(LocalizedFile("main.htm"), platform::Join(robjPrj.Folder, "main.htm"), tags);
    BuildSiteSearch(robjPrj);
    return kSuccess;
}

std::string CHelpPrjTree::GetTreeStr(std::string& rstrOptions, bool vfForceContentsRebuild) {
    ForgetSourceProject();
    const DefinitionCache::Holder holder(definitions_);
    if (root_ == nullptr)
        return {};
    return root_->TreeStr(1, rstrOptions, /*vfSkipSerializers=*/true, vfForceContentsRebuild);
}

void CHelpPrjTree::SortIndexOptions(std::string& lines, std::int32_t indent) {
    std::map<std::string, std::string, IgnoringCase> byCaption;
    for (const auto& part : text::Split(lines, kCrLf)) {
        auto line = text::Trim(part);
        if (!line.empty())
            byCaption.try_emplace(OptionCaption(line), std::move(line));
    }
    const std::string lead(static_cast<std::size_t>(indent), ' ');
    std::string sorted;
    for (const auto& [caption, line] : byCaption) {
        if (!sorted.empty())
            sorted += kCrLf;
        sorted += lead + line;
    }
    lines = std::move(sorted);
}

bool CHelpPrjTree::BuildSiteSearch(CAddInProject& robjPrj) {
    const auto engine = SearchEngine();
    const auto folder = platform::WithTrailingBackslash(robjPrj.Folder);
    const auto page = folder + "ss.html";
    auto exclusion = "-ihh_index_java.htm -ihh_toc_java.htm -imain.htm -i" + robjPrj.Name + "TOC.htm";
    for (const auto& backup : BackupPages(*this, platform::Env().files->ListFiles(folder, "*.htm")))
        exclusion += " -i" + backup;
    const auto outcome = platform::Env().processes->RunAndWait(
        '"' + engine + "\" -d\"" + platform::WithoutTrailingBackslash(folder) +
        "\" -ehtm -s0 -w1 -p1 -m1 -u3 -n4 " + exclusion + " -x");
    if (outcome.exitCode != 0)
        throw RaisedError(kFailure1, "Site search engine failed: " + text::Trim(outcome.output),
                          "CHelpPrjTree.BuildSiteSearch");
    PatchSiteSearchPage(page);
    return true;
}

void CHelpPrjTree::PatchSiteSearchPage(const std::string& path) {
    auto& files = *platform::Env().files;
    if (!files.FileExists(path))
        return;
    const auto original = files.ReadFile(path);
    auto page = WithoutHelpLine(original);
    // The search text comes from the frame page.
    page = text::ReplaceAllIgnoringCase(
        page,
        "<form>\r\n"
        "<table width=100% cellpadding=5 style=\"background-color:#EFF;border:2px solid #069\"><tr><td "
        "align=center>\r\n"
        "<em>Site Search</em><br>\r\n"
        "<input type=text name=\"s\" size=24 onKeyDown=\"if(event.keyCode==13)return NS()\">&nbsp;<input "
        "type=\"Button\" value=\"Go!\" onClick=\"return NS()\">\r\n"
        "</td></tr></table>\r\n"
        "</form>",
        "<form>\r\n"
        "<input type=hidden name=\"s\" size=24 onKeyDown=\"if(event.keyCode==13)return NS()\">\r\n"
        "</form>");
    // Results open in the page's own frame, not in a new window.
    page = text::ReplaceAllIgnoringCase(page,
                                        "function C(l){\r\n"
                                        " if(BW && !BW.closed) {BW.location.href=l;BW.focus();}\r\n"
                                        " else BW=window.open(l,\"\");",
                                        "function C(l){\r\n"
                                        " location.href=l;");
    if (page != original)
        files.WriteFile(path, page);
}

} // namespace tovimar
