#include "host/sources/CSourceProjectAspNet.h"

#include "foundation/ErrorTrap.h"
#include "host/contract/ObjectTypes.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

/// Lives as long as the reading.
class WorkingCopy {
public:
    explicit WorkingCopy(const std::string& path) : path_(path + ".tmp") {
        platform::Env().files->CopyFile(path, path_);
    }
    ~WorkingCopy() {
        PassOver([this] { platform::Env().files->DeleteFile(path_); });
    }
    WorkingCopy(const WorkingCopy&) = delete;
    WorkingCopy& operator=(const WorkingCopy&) = delete;

    const std::string& Path() const { return path_; }

private:
    std::string path_;
};

} // namespace

CSourceProjectAspNet::CSourceProjectAspNet()
    : XmlSourceProject({"CSourceProjectAspNet",
                        SourceProjectKind::kAspNet,
                        {"/VisualStudioProject/CSHARP", "/VisualStudioProject/VISUALJSHARP",
                         "/VisualStudioProject/VisualBasic"},
                        "Files/Include/*",
                        /*readsBuildItems=*/true}) {}

bool CSourceProjectAspNet::Read(const std::string& path) {
    return !HelpForFormsWanted() || ReadDocument(WorkingCopy(path).Path());
}

bool CSourceProjectAspNet::IsListed(CHelpPrjSourceItem& item) const {
    if (XmlSourceProject::IsListed(item))
        return true;
    const bool isPage = text::EndsWithIgnoringCase(item.RelativePath, ".aspx");
    if (!isPage && !text::EndsWithIgnoringCase(item.RelativePath, ".ascx"))
        return false;
    item.SubType = isPage ? "Form" : "UserControl";
    return true;
}

} // namespace tovimar
