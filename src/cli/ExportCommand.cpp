#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "platform/Environment.h"
#include "platform/access/database/TextExport.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <set>

namespace tovimar::cli {
namespace {

using platform::access::ExportedFile;

/// Files in the folders of exports that this run didn't write; objects that the database lost leave them.
std::vector<std::string> Leftovers(const std::string& folder, const std::set<std::string>& written) {
    auto& files = *platform::Env().files;
    std::vector<std::string> leftovers;
    for (const char* kind : {"forms", "reports", "macros", "modules", "queries"}) {
        if (!files.FolderExists(folder + "\\" + kind))
            continue;
        for (const std::string& name : files.ListFiles(folder + "\\" + kind, "*.*"))
            if (!written.contains(text::FoldCase(std::string(kind) + "/" + name)))
                leftovers.push_back(std::string(kind) + "/" + name);
    }
    return leftovers;
}

int Write(const Arguments& arguments, ProgressLine& progress) {
    auto& files = *platform::Env().files;
    const std::string folder =
        platform::WithoutTrailingBackslash(files.FromNative(FullPath(arguments.output)));
    std::set<std::string> written;
    std::size_t changed = 0;
    const auto faults =
        platform::access::ExportDatabase(FullPath(arguments.source), [&](const ExportedFile& file) {
            StopIfInterrupted();
            progress.Detail("Writing " + file.path);
            const std::string path = folder + "\\" + text::ReplaceAll(file.path, "/", "\\");
            written.insert(text::FoldCase(file.path));
            if (files.FileExists(path) && files.ReadFile(path) == file.bytes)
                return;
            files.MakeFolders(platform::FolderOf(path));
            files.WriteFile(path, file.bytes);
            ++changed;
        });
    progress.Clear();
    for (const std::string& fault : faults)
        PrintError(fault);
    for (const std::string& name : Leftovers(folder, written))
        PrintWarning("not of this database: '" + name + "'");
    PrintResult(std::to_string(written.size()) + " files, " + std::to_string(changed) +
                " of them new or changed.");
    PrintResult("Exports:       " + files.ToNative(folder));
    return faults.empty() ? kDone : kFailed;
}

} // namespace

int ExportTexts(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Write(arguments, surroundings.Progress()); });
}

} // namespace tovimar::cli
