#include "generation/HelpUtilities.h"

#include "foundation/CUTF8FileReader.h"
#include "foundation/CUTF8FileWriter.h"
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"

#include <array>
#include <optional>
#include <utility>

namespace tovimar {
namespace {

/// Tag and value of a list's entry; nothing for an entry without a separator.
std::optional<std::pair<std::string, std::string>> SplitTag(const std::string& entry) {
    const auto separator = entry.find('|');
    if (separator == std::string::npos)
        return std::nullopt;
    return std::pair(text::Trim(entry.substr(0, separator)), text::Trim(entry.substr(separator + 1)));
}

std::string FilledTemplate(const std::string& path, const std::vector<std::string>& tags) {
    CUTF8FileReader reader;
    if (reader.LoadFile(path) != kSuccess)
        return {};
    std::string filled = reader.Text();
    if (const auto* parameters = Session::Parameters())
        parameters->ReplaceTags(filled);
    for (const std::string& entry : tags)
        if (const auto tag = SplitTag(entry))
            filled = text::ReplaceAllIgnoringCase(filled, tag->first, tag->second);
    return filled;
}

} // namespace

std::string GetStyleSheetLinkHtml(const std::string& vstrCSSFullPath) {
    if (vstrCSSFullPath.empty())
        return {};
    return "<link href=\"" + platform::FileNameOf(vstrCSSFullPath) +
           "\" type=\"text/css\" rel=\"stylesheet\" >";
}

std::string ReplaceTagsAndCopy(const std::string& vstrTemplateFullPath, const std::string& vstrTargetFullPath,
                               const std::vector<std::string>& rcolTags) {
    std::string page;
    if (!vstrTemplateFullPath.empty() && platform::Env().files->FileExists(vstrTemplateFullPath))
        page = FilledTemplate(vstrTemplateFullPath, rcolTags);
    page = Session::Messages()->ReplaceParameters(page);
    if (vstrTargetFullPath.empty())
        return page;
    CUTF8FileWriter writer;
    const ResultCode result = writer.SaveFile(vstrTargetFullPath, page, /*vfAddUTF8FileHeader=*/false,
                                              /*vfSaveAsUsualTextFileIfNotUTF8=*/true);
    if (result != kSuccess)
        throw RaisedError(kFailure1, "Error saving file " + vstrTargetFullPath,
                          "modTovimarUtils.ReplaceTagsAndCopy");
    return page;
}

std::int32_t GetTreeIconIndex(const std::string& vstrKey) {
    constexpr std::array<const char*, 7> kImages{"hlpclose",  "no",   "openedBook", "document",
                                                 "document1", "form", "report"};
    for (std::size_t i = 0; i < kImages.size(); ++i)
        if (text::EqualsIgnoringCase(vstrKey, kImages[i]))
            return static_cast<std::int32_t>(i);
    return 0;
}

void SetTreeNodeIcon(CHelpPrjTreeNode& node) {
    if (node.TreeViewNode == nullptr)
        return;
    const char* image = node.TreeViewNode->Expanded() ? "openedBook" : "hlpclose";
    if (node.Children().Empty())
        image = "helptopic";
    node.TreeViewNode->SetImage(node.Skipped() ? "no" : image);
}

bool IsFormModuleName(const std::string& vstrName) {
    return text::StartsWithIgnoringCase(vstrName, "Form_");
}

bool IsReportModuleName(const std::string& vstrName) {
    return text::StartsWithIgnoringCase(vstrName, "Report_");
}

bool IsFormOrReportModuleName(const std::string& vstrName) {
    return IsFormModuleName(vstrName) || IsReportModuleName(vstrName);
}

std::string GetZoomStyleHtml(const std::string& vstrPercent) {
    if (vstrPercent.empty())
        return {};
    return "<style type=\"text/css\" media=\"screen\">\r\nbody {zoom: " + vstrPercent + "}\r\n</style>\r\n";
}

std::string ShortenCaption(const std::string& vstrText) {
    constexpr std::size_t kLongest = 32;
    return text::Length(vstrText) > kLongest ? text::Left(vstrText, kLongest) + "..." : vstrText;
}

std::vector<std::string> SplitToList(const std::string& vstrText) {
    return vstrText.empty() ? std::vector<std::string>() : text::Split(vstrText, "|");
}

bool SetRelativePath(const std::string& vstrPath) {
    bool changed = false;
    Trapped("modTovimarUtils", "SetRelativePath", [&] {
        const std::string folder = platform::FolderOf(vstrPath);
        CUTF8FileReader reader;
        if (folder.empty() || reader.LoadFile(vstrPath) != kSuccess ||
            !text::ContainsIgnoringCase(reader.Text(), folder))
            return;
        std::string page = reader.Text();
        for (const char* scheme : {"file:///", "file://", ""})
            page = text::ReplaceAllIgnoringCase(page, scheme + folder, "");
        changed = CUTF8FileWriter().SaveFile(vstrPath, page, reader.HasUTF8Header(),
                                             /*vfSaveAsUsualTextFileIfNotUTF8=*/!reader.IsUTF8()) == kSuccess;
    });
    return changed;
}

void WarningDialog(const std::string& vstrText) {
    ShowMessage(vstrText, kMsgExclamation, kApplicationTitle, {}, 0, "modTovimarUtils.WarningDialog");
}

} // namespace tovimar
