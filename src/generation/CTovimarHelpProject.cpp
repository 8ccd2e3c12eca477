/// The help compiler's project file and the file of text popups beside it.
#include "foundation/CAddInProject.h"
#include "foundation/CCodePages.h"
#include "foundation/CUTF8FileWriter.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/HelpProjectText.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/BackupPages.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

#include <algorithm>
#include <array>
#include <unordered_set>

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimar";

/// The web help's own pages stay out of the compiled help.
bool IsWebHelpPage(const std::string& file) {
    constexpr std::array<const char*, 3> kPages{"hh_index_java.htm", "hh_toc_java.htm", "main.htm"};
    return std::any_of(kPages.begin(), kPages.end(),
                       [&](const char* page) { return text::EqualsIgnoringCase(file, page); });
}

std::vector<std::string> TopicFiles(const CHelpPrjTree& tree, const std::string& folder) {
    auto files = platform::Env().files->ListFiles(folder, "*.htm");
    const auto backups = BackupPages(tree, files);
    const std::unordered_set<std::string> left(backups.begin(), backups.end());
    std::erase_if(files, [&](const auto& file) { return IsWebHelpPage(file) || left.contains(file); });
    return files;
}

std::vector<std::string> PictureFiles(CAddInProject& project) {
    const std::string folder = project.PicsSubfolderPath();
    const std::string prefix = platform::WithTrailingBackslash(project.PicsSubfolderName);
    std::vector<std::string> pictures;
    if (!platform::Env().files->FolderExists(folder))
        return pictures;
    for (const char* pattern : {"*.bmp", "*.jpg"})
        for (const std::string& file : platform::Env().files->ListFiles(folder, pattern))
            pictures.push_back(prefix + file);
    return pictures;
}

std::string LanguageOfCompiler(const std::string& languageCode) {
    const std::string code = text::Trim(languageCode);
    if (code.empty())
        return {};
    CCodePages pages;
    const CCodePage* page = pages.GetCodePageByLanguageCode(code);
    return page == nullptr ? std::string() : text::Trim(page->HHPLName);
}

} // namespace

ResultCode CTovimar::CreateHHPAndRelatedFiles(const std::string& vstrFullPath) {
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "CreateHHPAndRelatedFiles", [&] {
        auto* project = Session::CurrentProject();
        const auto* root = HelpProjectTree().Root();
        if (project == nullptr || root == nullptr) {
            result = kGeneralFailure;
            return;
        }
        HelpProjectContents contents;
        contents.name = project->Name;
        contents.title = project->Title();
        contents.defaultTopic = root->GeneratedHTMLFile();
        contents.associateIndex = parameters_->AssociateHelpIndex;
        contents.fullTextSearch = parameters_->AddSearchTabToHelp;
        contents.language = LanguageOfCompiler(parameters_->LanguageCode);
        contents.topics = TopicFiles(HelpProjectTree(), project->Folder);
        contents.pictures = PictureFiles(*project);
        const std::string path =
            vstrFullPath.empty() ? platform::Join(project->Folder, project->Name + ".hhp") : vstrFullPath;
        platform::Env().files->WriteFile(path, EncodePlainText(HelpProjectText(contents)));
        CreateHTextFile();
    });
    return trapped != kSuccess ? trapped : result;
}

void CTovimar::CreateHTextFile() {
    Trapped(kClass, "CreateHTextFile", [&] {
        const auto* project = Session::CurrentProject();
        if (project == nullptr)
            return;
        const std::string folder = parameters_->FolderForGeneratedHelp();
        const auto topics = TopicFiles(HelpProjectTree(), project->Folder);
        platform::Env().files->WriteFile(folder + project->Name + ".txt",
                                         EncodePlainText(TextPopupsText(topics)));
    });
}

} // namespace tovimar
