#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/SitemapText.h"
#include "project/clsHHK.h"

/// Contents file and index file.
namespace tovimar {

ResultCode CHelpPrjTree::SaveHHC(const std::string& vstrHHCFileFullPath, bool vfForceContentsRebuild) {
    bool readOnly = false;
    return Trapped(
        "CHelpPrjTree", "SaveHHC",
        [&] {
            readOnly = ExistsAndReadOnly(vstrHHCFileFullPath);
            auto contents = GetHHCStr(vfForceContentsRebuild);
            LeaveIfInterrupted();
            PrintSitemap(vstrHHCFileFullPath, std::move(contents));
        },
        [&] { return ReadOnlyDetail(readOnly) + kCrLf + "HHCFileFullPath = " + vstrHHCFileFullPath; });
}

std::string CHelpPrjTree::GetHHCStr(bool vfForceContentsRebuild) {
    ForgetSourceProject();
    const DefinitionCache::Holder holder(definitions_);
    std::string out = "<!DOCTYPE HTML PUBLIC \"-//IETF//DTD HTML//EN\">\r\n"
                      "<HTML>\r\n"
                      "<HEAD>\r\n"
                      "<meta name=\"GENERATOR\" content=\"Microsoft&reg; HTML Help Workshop 4.1\">\r\n"
                      "<!-- Sitemap 1.0 -->\r\n"
                      "<!-- Put Java help object tag here -->\r\n"
                      "</HEAD>\r\n"
                      "<BODY>\r\n"
                      "<UL>\r\n";
    if (root_ != nullptr)
        out += root_->HHCStr(1, /*vfSkipSerializers=*/true, vfForceContentsRebuild);
    out += "</UL>\r\n</BODY>\r\n</HTML>\r\n";
    return out;
}

ResultCode CHelpPrjTree::MakeAndSaveHHK(const std::string& vstrHHKFileFullPath) {
    bool readOnly = false;
    return Trapped(
        "CHelpPrjTree", "MakeAndSaveHHK",
        [&] {
            ForgetSourceProject();
            readOnly = ExistsAndReadOnly(vstrHHKFileFullPath);
            const DefinitionCache::Holder holder(definitions_);
            std::unique_ptr<clsHHK> own;
            auto* generator = Session::Generator();
            if (generator != nullptr)
                generator->HelpIndex().Reset();
            else
                own = std::make_unique<clsHHK>();
            auto& index = generator != nullptr ? generator->HelpIndex() : *own;
            if (root_ != nullptr)
                root_->AddIndexLinks(index);
            LeaveIfInterrupted();
            PrintSitemap(vstrHHKFileFullPath, index.HHKContents());
        },
        [&] { return "HHKFileFullPath = " + vstrHHKFileFullPath + kCrLf + ReadOnlyDetail(readOnly); });
}

} // namespace tovimar
