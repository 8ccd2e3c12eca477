#include "generation/CTovimarParameters.h"

#include "foundation/CAddInProject.h"
#include "foundation/Paths.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

using platform::WithTrailingBackslash;

/// Location and name of the source project, asked of the host only where a text needs them: most texts don't.
class SourceProject {
public:
    SourceProject(bool bypass, const std::string& folder, const std::string& name)
        : bypass_(bypass), folder_(folder), name_(name) {}

    std::string Location() const {
        if (bypass_)
            return folder_;
        auto* agent = Session::ServerAgent();
        const std::string location = agent == nullptr ? std::string() : agent->CurrentSourceProjectLocation();
        return location.empty() ? TemporaryFolder() : location;
    }

    std::string Name() const {
        if (bypass_)
            return name_;
        auto* agent = Session::ServerAgent();
        return agent == nullptr ? std::string() : agent->CurrentSourceProjectName();
    }

private:
    bool bypass_;
    const std::string& folder_;
    const std::string& name_;
};

template <typename ValueOf> void ReplaceTag(std::string& text, std::string_view tag, const ValueOf& valueOf) {
    if (text.find(tag) != std::string::npos)
        text = text::ReplaceAll(text, tag, valueOf());
}

} // namespace

std::string CTovimarParameters::Author() const {
    if (author_.empty())
        author_ = text::Left(platform::Env().userName, 200);
    return author_;
}

std::string CTovimarParameters::CSSFullPath() const {
    const auto* project = Session::CurrentProject();
    if (cssFullPath_.empty() || platform::HasFolder(cssFullPath_) || project == nullptr)
        return cssFullPath_;
    return platform::Join(project->Folder, cssFullPath_);
}

std::string CTovimarParameters::FolderForGeneratedHelp() const {
    std::string folder = folderForGeneratedHelp_;
    if (text::Length(folder) > 2)
        folder = WithTrailingBackslash(folder);
    folder = text::ReplaceAll(folder, "{Project Location}\\", "{{ProjectLocation}}");
    folder = text::Trim(WithTrailingBackslash(folder));
    const std::string network = folder.starts_with("\\\\") ? "\\\\" : "";
    return network + text::ReplaceAll(folder.substr(network.size()), "\\\\", "\\");
}

std::string CTovimarParameters::FolderForGeneratedImages() const {
    return FolderForGeneratedHelp() + NameOfFolderForGeneratedImagesWithSlash();
}

std::string CTovimarParameters::NameOfFolderForGeneratedImages() const {
    const std::string name = platform::WithoutTrailingBackslash(nameOfFolderForGeneratedImages_);
    return name.empty() ? "images" : name;
}

std::string CTovimarParameters::NameOfFolderForGeneratedImagesWithSlash() const {
    return NameOfFolderForGeneratedImages() + "\\";
}

void CTovimarParameters::SetNameOfFolderForGeneratedImages(const std::string& value) {
    nameOfFolderForGeneratedImages_ = WithTrailingBackslash(value);
}

std::string CTovimarParameters::CompiledHelpFullPath() const {
    const auto* project = Session::CurrentProject();
    return FolderForGeneratedHelp() + (project == nullptr ? std::string() : project->Name) + ".chm";
}

std::string CTovimarParameters::HelpProjectName() const {
    const auto* project = Session::CurrentProject();
    if (!helpProjectName_.empty() || project == nullptr)
        return helpProjectName_;
    return project->Name;
}

std::string CTovimarParameters::HelpProjectTitle() const {
    return helpProjectTitle_.empty() ? HelpProjectName() : helpProjectTitle_;
}

std::string& CTovimarParameters::ReplaceTags(std::string& ForString, bool vfByPassCallBack,
                                             const std::string& vstrSourceProjectFolder,
                                             const std::string& vstrSourceProjectName) const {
    if (ForString.find('{') == std::string::npos)
        return ForString;
    const SourceProject source(vfByPassCallBack, vstrSourceProjectFolder, vstrSourceProjectName);
    // The double-braced forms go first, so that a value that holds a single-braced tag is still expanded.
    ReplaceTag(ForString, "{{Application}}", [&] { return ApplicationNameStr; });
    ReplaceTag(ForString, "{{ProjectName}}", [&] { return source.Name(); });
    ReplaceTag(ForString, "{{HelpProjectName}}", [&] { return HelpProjectName(); });
    ReplaceTag(ForString, "{{HelpProjectTitle}}", [&] { return HelpProjectTitle(); });
    ReplaceTag(ForString, "{{Organization}}", [&] { return Organization; });
    ReplaceTag(ForString, "{{Author}}", [&] { return Author(); });
    ReplaceTag(ForString, "{{Copyright}}", [&] { return Copyright; });
    ReplaceTag(ForString, "{{Website}}", [&] { return Website; });
    ReplaceTag(ForString, "{{Email}}", [&] { return email; });
    ReplaceTag(ForString, "{{RegistrationURL}}", [&] { return RegistrationURL; });
    ReplaceTag(ForString, "{{Project Location}}", [&] { return source.Location(); });
    ReplaceTag(ForString, "{{HtmlTovimarTitleAndVersion}}", [] { return TitleAndVersion(); });
    ReplaceTag(ForString, "{{HtmlTovimarVersion}}", [] { return VersionText(); });
    ReplaceTag(ForString, "{Application}", [&] { return ApplicationNameStr; });
    ReplaceTag(ForString, "{ProjectName}", [&] { return source.Name(); });
    ReplaceTag(ForString, "{Organization}", [&] { return Organization; });
    ReplaceTag(ForString, "{Author}", [&] { return Author(); });
    ReplaceTag(ForString, "{Copyright}", [&] { return Copyright; });
    ReplaceTag(ForString, "{Website}", [&] { return Website; });
    ReplaceTag(ForString, "{Email}", [&] { return email; });
    ReplaceTag(ForString, "{RegistrationURL}", [&] { return RegistrationURL; });
    ReplaceTag(ForString, "{Project Location}", [&] { return source.Location(); });
    return ForString;
}

std::unique_ptr<CTovimarParameters> CTovimarParameters::Clone() const {
    return std::make_unique<CTovimarParameters>(*this);
}

} // namespace tovimar
