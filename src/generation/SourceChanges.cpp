#include "generation/SourceChanges.h"

#include "foundation/BackupFileName.h"
#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/access/AccessApplication.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

using platform::access::SavedObject;

/// The copies begin with this file, which also keeps the folder from being read as an application when the
/// help lies among the exports.
constexpr const char* kNote =
    "Copies of the application's exports with the help context ids of the last run.\r\n"
    "They differ from the originals in the lines HelpContextId and HelpFile only.\r\n"
    "The next run that writes context ids makes them anew.\r\n";

/// A reader of exports knows nothing of ".bak", so the backup isn't taken for an object.
std::string BackupPath(const std::string& path) {
    const std::string backup = path + ".bak";
    return platform::Env().files->FileExists(backup) ? BackupFileName(backup) : backup;
}

void RemoveFilesBelow(const std::string& folder) {
    auto& files = *platform::Env().files;
    for (const std::string& file : files.ListFiles(folder, "*.*"))
        files.DeleteFile(platform::Join(folder, file));
    for (const std::string& inner : files.ListFolders(folder))
        RemoveFilesBelow(platform::Join(folder, inner));
}

} // namespace

SourceChanges::SourceChanges(Target target, const std::string& sourceFolder, const std::string& copiesFolder)
    : target_(target), sourceFolder_(platform::WithTrailingBackslash(sourceFolder)),
      copiesFolder_(platform::WithTrailingBackslash(copiesFolder)) {}

void SourceChanges::Attach(const HostObject& application, Earlier earlier) {
    if (earlier == Earlier::Remove)
        RemoveCopies();
    platform::access::SetObjectSaver(application, [this](const SavedObject& saved) { Take(saved); });
}

/// Only a folder that bears the note is one of ours.
void SourceChanges::RemoveCopies() const {
    if (platform::Env().files->FileExists(copiesFolder_ + platform::access::kNoApplicationMark))
        RemoveFilesBelow(platform::WithoutTrailingBackslash(copiesFolder_));
}

void SourceChanges::Take(const SavedObject& saved) {
    if (saved.exportPath.empty()) {
        notWritten_.push_back(saved.name);
        return;
    }
    try {
        Write(saved);
    } catch (const RaisedError& failure) {
        failures_.emplace_back(failure.what());
    }
}

void SourceChanges::Write(const SavedObject& saved) {
    auto& files = *platform::Env().files;
    const std::string bytes = files.ReadFile(saved.exportPath);
    const std::string changed =
        platform::access::WithHelpProperties(bytes, saved.changes, files.ToNative(saved.exportPath));
    if (changed == bytes)
        return;
    if (target_ == Target::Originals)
        WriteOriginal(saved.exportPath, changed);
    else
        WriteCopy(saved.exportPath, changed);
    ++written_;
}

void SourceChanges::WriteOriginal(const std::string& path, const std::string& bytes) const {
    auto& files = *platform::Env().files;
    if (files.IsReadOnly(path))
        throw RaisedError(70, "the file is read-only: '" + files.ToNative(path) + "'", "SourceChanges");
    const std::string backup = BackupPath(path);
    files.CopyFile(path, backup);
    try {
        files.WriteFile(path, bytes);
    } catch (const RaisedError&) {
        PassOver([&] { files.DeleteFile(backup); });
        throw;
    }
}

void SourceChanges::WriteCopy(const std::string& path, const std::string& bytes) const {
    auto& files = *platform::Env().files;
    const bool below = text::StartsWithIgnoringCase(path, sourceFolder_);
    const std::string copy =
        copiesFolder_ + (below ? path.substr(sourceFolder_.size()) : platform::FileNameOf(path));
    files.MakeFolders(platform::FolderOf(copy));
    if (const std::string mark = copiesFolder_ + platform::access::kNoApplicationMark;
        !files.FileExists(mark))
        files.WriteFile(mark, kNote);
    files.WriteFile(copy, bytes);
}

} // namespace tovimar
