#include "foundation/CAddInProject.h"

#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"

namespace tovimar {

const std::string& CAddInProject::SourceProjectsList() {
    if (sourceProjectsList_.empty())
        RefreshSourceProjectsList();
    return sourceProjectsList_;
}

void CAddInProject::RefreshSourceProjectsList() {
    sourceProjectsList_ = Session::Context().SourceProjectsList();
}

std::string CAddInProject::PicsSubfolderPath() {
    const auto path = [&] {
        return platform::WithTrailingBackslash(platform::Join(Folder, PicsSubfolderName));
    };
    if (PicsSubfolderName.empty() || !platform::Env().files->FolderExists(path()))
        PicsSubfolderName = "images";
    return path();
}

std::string CAddInProject::XmlFormsFolder() const {
    return platform::Join(Folder, "xml\\");
}

std::string CAddInProject::FilePath(const char* extension) const {
    return FileName.empty() ? std::string() : platform::Join(Folder, FileName + extension);
}

} // namespace tovimar
