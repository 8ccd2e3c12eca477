#include "generation/HelpUtilities.h"

#include "foundation/CUTF8FileReader.h"
#include "foundation/CUTF8FileWriter.h"
#include "foundation/CXmlMessages.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

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

bool CreateFolderPath(const std::string& vstrPath) {
    try {
        platform::Env().files->MakeFolders(vstrPath);
        return true;
    } catch (const RaisedError&) {
        return false;
    }
}

bool TestFolderWritable(const std::string& vstrFolder) {
    auto& files = *platform::Env().files;
    const std::string probe = platform::Join(vstrFolder, "test.txt");
    try {
        // Somebody's own file of that name is only opened.
        const bool taken = files.FileExists(probe);
        files.AppendFile(probe, {});
        if (!taken)
            files.DeleteFile(probe);
        return true;
    } catch (const RaisedError&) {
        return false;
    }
}

std::int32_t ShellExecute(const std::string& file, const std::string& /*verb*/, const std::string& parameters,
                          bool vfWait) {
    constexpr std::int32_t kDone = 42;
    constexpr std::int32_t kNoProgram = 31;
    if (!vfWait && parameters.empty())
        return platform::Env().processes->Open(file) ? kDone : kNoProgram;
    const ResultCode result =
        ShellAndWait("\"" + file + "\"" + (parameters.empty() ? "" : " " + parameters), 1);
    return result == kSuccess ? kDone : result;
}

ResultCode ShellAndWait(const std::string& command, std::int32_t /*windowStyle*/) {
    try {
        platform::Env().processes->RunAndWait(command);
        return kSuccess;
    } catch (const RaisedError& failure) {
        return failure.Number();
    }
}

void WarningDialog(const std::string& vstrText) {
    ShowMessage(vstrText, kMsgExclamation, kApplicationTitle, {}, 0, "modTovimarUtils.WarningDialog");
}

} // namespace tovimar
