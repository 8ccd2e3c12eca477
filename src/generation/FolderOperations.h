#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <string>

/// Folders, files and programs, in the few ways that the steps of a generation need.
namespace tovimar {

/// Makes the folder with all missing parents; true when it stands afterwards.
bool CreateFolderPath(const std::string& vstrPath);
/// True when a file "test.txt" could be made in the folder; it is deleted again.
bool TestFolderWritable(const std::string& vstrFolder);
/// Copies the folder with all that is below it into "BAK_<date and time>" beside it. The copy's path with a
/// trailing backslash; empty when there was nothing to copy, or when it failed, which is reported.
std::string MakeBackupForFolder(const std::string& vstrFolder);
/// Copies the folder's files that match, under their names, over what stands there. No folder, no files.
void CopyFilesByMask(const std::string& vstrSourceFolder, const std::string& vstrTargetFolder,
                     const std::string& vstrMask);

/// Deletes what a killed run has left unfinished in the folder; a missing folder has nothing.
void RemoveUnfinishedFiles(const std::string& vstrFolder);

/// Bits of `GetPathAttributes`.
enum PathAttributes : std::int32_t {
    kAttributeReadOnly = 1,
    kAttributeFolder = 16,
    kAttributeFile = 32,
};
/// -1 for a path where nothing stands.
std::int32_t GetPathAttributes(const std::string& vstrPath);

/// Opens a file or folder with its program for "open", or runs it as a program where parameters are given or
/// its end is to be waited for. Above 32 for success, as the platform has it; else 31, or the failure of the
/// start.
std::int32_t ShellExecute(const std::string& vstrFile, const std::string& vstrVerb,
                          const std::string& vstrParameters, bool vfWait);
/// Runs a command line and waits for its end without limit. 0, or the failure of the start. Programs show no
/// window of their own here, whatever the style.
ResultCode ShellAndWait(const std::string& vstrCommand, std::int32_t vlngWindowStyle);

} // namespace tovimar
