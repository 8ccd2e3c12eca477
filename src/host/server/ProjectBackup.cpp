/// The three last states of a project file.
#include "foundation/ErrorTrap.h"
#include "host/server/CTovimarServer.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar {

bool CTovimarServer::BackUpHelpProjectFile(const std::string& vstrFullPath) {
    if (vstrFullPath.empty())
        return true;
    return kSuccess == Trapped("CTovimarServer", "BackUpHelpProjectFile", [&] {
               auto& files = *platform::Env().files;
               const std::string folder = platform::FolderOf(vstrFullPath);
               const std::string file = platform::FileNameOf(vstrFullPath) + ".bak";
               const std::string newest = folder + "z1_" + file;
               const std::string middle = folder + "z2_" + file;
               const std::string oldest = folder + "z3_" + file;
               if (!files.FileExists(newest)) {
                   for (const std::string& backup : {newest, middle, oldest})
                       files.CopyFile(vstrFullPath, backup);
                   return;
               }
               // Three backups of one state are not kept.
               if (files.FileLength(vstrFullPath) == files.FileLength(newest) &&
                   text::EqualsIgnoringCase(files.ReadFile(vstrFullPath), files.ReadFile(newest)))
                   return;
               if (files.FileExists(middle))
                   files.CopyFile(middle, oldest);
               files.CopyFile(newest, middle);
               files.CopyFile(vstrFullPath, newest);
           });
}

} // namespace tovimar
