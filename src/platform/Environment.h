#pragma once

#include "platform/Error.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// The surroundings of the system: what the operating system, its registry, its clock and its windows gave.
/// A program's main and the test fixture set up one Environment; code asks `Env()`, so a test can put a
/// fake in place of each part.
namespace tovimar::platform {

class WindowSystem; // platform/windowing/WindowSystem.h

/// Held as long as it lives.
class FolderLock {
public:
    virtual ~FolderLock() = default;
};

/// Files. A path is a Windows path: backslashes, "Z:\" is the root of the machine, "C:\" the drive folder
/// in the user's data directory. Look-ups ignore case: an existing entry is found whatever its case.
/// Failures raise RaisedError 53 "File not found", 70 "Permission denied", 75 "Path/File access error",
/// 76 "Path not found", 61 "Disk full", each with the native path in the text.
class FileSystem {
public:
    virtual ~FileSystem() = default;

    /// Names of files that are being written beside the ones that they are to replace.
    static constexpr const char* kUnfinishedFiles = ".tovimar-??????";

    virtual bool FileExists(const std::string& path) = 0;
    virtual bool FolderExists(const std::string& path) = 0;
    virtual std::string ReadFile(const std::string& path) = 0;
    /// Replaces the file by a finished one: the old file stands until the new bytes are on the disk.
    virtual void WriteFile(const std::string& path, std::string_view bytes) = 0;
    /// The same, and when it returns the file is on the disk itself: what a power cut leaves is the old file
    /// or the new one. Milliseconds per file; for the few that nobody can make again.
    virtual void WriteFileToDisk(const std::string& path, std::string_view bytes) = 0;
    virtual void AppendFile(const std::string& path, std::string_view bytes) = 0;
    /// Overwrites `bytes` at `offset` in an existing file and cuts the file behind them. A short end that
    /// can't be replaced, on a full disk say, is put back.
    virtual void OverwriteTail(const std::string& path, std::uint64_t offset, std::string_view bytes) = 0;
    virtual void DeleteFile(const std::string& path) = 0;
    /// Raises 58 "File already exists" when the target stands.
    virtual void RenameFile(const std::string& from, const std::string& to) = 0;
    /// Replaces an existing target; the copy gets the time of the original.
    virtual void CopyFile(const std::string& from, const std::string& to) = 0;
    /// Makes the folder with all its missing parents; an existing folder is no failure.
    virtual void MakeFolders(const std::string& path) = 0;
    virtual std::uint64_t FileLength(const std::string& path) = 0;
    virtual bool IsReadOnly(const std::string& path) = 0;
    /// When the file was last written, in whole seconds since 1970.
    virtual std::int64_t FileTime(const std::string& path) = 0;
    /// File names (no folders) that match the pattern ("*.htm", "*.*"), sorted without regard to case.
    virtual std::vector<std::string> ListFiles(const std::string& folder, const std::string& pattern) = 0;
    virtual std::vector<std::string> ListFolders(const std::string& folder) = 0;

    /// Keeps other processes of the system that ask for it out of a folder whose files they share. Waits up
    /// to five seconds for them. Null when that wasn't enough or the folder can't be locked: better to go on
    /// than never to save.
    virtual std::unique_ptr<FolderLock> LockFolder(const std::string& folder) = 0;

    /// For printing to a person and for other programs.
    virtual std::string ToNative(const std::string& path) = 0;
    /// A relative native path is taken from the working directory.
    virtual std::string FromNative(const std::string& nativePath) = 0;
};

/// The registry: text values under keys such as "HKEY_LOCAL_MACHINE\SOFTWARE\Tovimar"; an empty value name
/// is the key's default value. Names ignore case.
class Registry {
public:
    virtual ~Registry() = default;
    /// Empty when the key or the value is absent.
    virtual std::string Read(const std::string& key, const std::string& valueName = {}) = 0;
    virtual void Write(const std::string& key, const std::string& valueName, const std::string& text) = 0;
};

/// Started programs.
class Processes {
public:
    virtual ~Processes() = default;
    struct Outcome {
        int exitCode = 0;
        /// What the program printed, both streams in order, cut at 1 MiB.
        std::string output;
    };
    /// Runs a command line as the platform writes it: `"C:\dir\hhc.exe" "C:\x y\p.hhp"`; the program's path
    /// and quoted arguments are Windows paths and are handed over as native ones. Waits without a limit;
    /// an interrupt of the user ends the child and raises kGeneralFailure.
    /// Raises 0x80040001 with the reason when the program can't be started.
    virtual Outcome RunAndWait(const std::string& commandLine) = 0;
    /// Opens a file, folder or address with the desktop's program. False when there is none.
    virtual bool Open(const std::string& pathOrAddress) = 0;
};

struct DateTime {
    int year = 2000, month = 1, day = 1, hour = 0, minute = 0, second = 0;
    double secondsSinceMidnight = 0;
};

/// Local time of whole seconds since 1970.
DateTime LocalTime(std::int64_t secondsSince1970);

class Clock {
public:
    virtual ~Clock() = default;
    /// Local time.
    virtual DateTime Now() = 0;
    /// Seconds since midnight as a fraction, for intervals.
    virtual double Timer() = 0;
};

/// Fresh identifiers, text form of a GUID in braces, upper case.
class Identifiers {
public:
    virtual ~Identifiers() = default;
    virtual std::string NewGuid() = 0;
};

/// Shows a box and gives the pressed button: 1 OK, 2 Cancel, 3 Abort, 4 Retry, 5 Ignore, 6 Yes, 7 No.
class MessageBoxes {
public:
    virtual ~MessageBoxes() = default;
    virtual int Show(const std::string& text, std::uint32_t flags, const std::string& title) = 0;
};

/// The host's status area and the system's own progress window, as the program at hand shows them.
class ProgressView {
public:
    virtual ~ProgressView() = default;
    virtual void Begin(const std::string& message, std::int32_t maximum) = 0;
    virtual void Update(const std::string& message, std::int32_t value) = 0;
    virtual void End() = 0;
};

/// The help viewer (HtmlHelp): command 0 topic, 1 contents, 2 index, 3 search, 15 context.
class HelpViewer {
public:
    virtual ~HelpViewer() = default;
    /// The window's number, 0 when none opened.
    virtual std::int32_t Show(std::int32_t callerWindow, const std::string& helpFile, std::uint32_t command,
                              const std::string& data) = 0;
    /// Keeps a window that `Show` gave above all others, without moving or activating it.
    virtual void MakeTopmost(std::int32_t /*window*/) {}
    virtual bool IsOpen(std::int32_t /*window*/) { return false; }
    virtual void Close(std::int32_t /*window*/) {}
};

/// One-shot timers of the thread that shows windows: a program with a message loop puts its own in.
class Timers {
public:
    virtual ~Timers() = default;
    /// Calls `tick` once, when the milliseconds are over. The timer's number, never 0.
    virtual std::int32_t Start(std::int32_t milliseconds, std::function<void()> tick) = 0;
    /// A timer that is over or unknown does nothing.
    virtual void Stop(std::int32_t timer) = 0;
};

/// Known folders, as Windows paths with a trailing backslash.
struct KnownFolders {
    std::string temporary;
    /// For files that are read back and deleted at once: in memory where the machine has a folder for that,
    /// since a disk's file system remembers every one of them. Empty: `temporary`.
    std::string passing;
    std::string applicationData;
    std::string programFiles;
    /// The folder of the running program; the installation folder falls back on it.
    std::string program;
};

struct Environment {
    std::unique_ptr<FileSystem> files;
    std::unique_ptr<Registry> registry;
    std::unique_ptr<Processes> processes;
    std::unique_ptr<Clock> clock;
    std::unique_ptr<Identifiers> identifiers;
    std::unique_ptr<MessageBoxes> messageBoxes;
    /// The host's meter.
    std::unique_ptr<ProgressView> hostMeter;
    /// The system's own progress window.
    std::unique_ptr<ProgressView> progressWindow;
    std::unique_ptr<HelpViewer> helpViewer;
    std::unique_ptr<WindowSystem> windows;
    std::unique_ptr<Timers> timers;
    KnownFolders folders;
    std::string userName;
    /// Lets pending work of the surroundings run: Ctrl+C, window events. Called at the points where the
    /// system lets messages run.
    std::function<void()> doEvents = [] {};
    /// The system's default language identifier, 1033 for English (United States).
    std::int32_t languageId = 1033;

    Environment();
    ~Environment();
    Environment(Environment&&) noexcept;
    Environment& operator=(Environment&&) noexcept;
};

/// The environment in force. Raises when none was set.
Environment& Env();
/// Puts an environment in force and gives back the one that was (none at first).
std::unique_ptr<Environment> SetEnvironment(std::unique_ptr<Environment> environment);

/// Settings of the real environment. Empty fields take the platform's places: XDG_DATA_HOME,
/// XDG_CONFIG_HOME, TMPDIR.
struct RealEnvironmentOptions {
    std::string dataFolder;    ///< native; holds drive C and the application data
    std::string configFolder;  ///< native; holds the registry file
    std::string programFolder; ///< native; the folder of the running program
};
/// Files on the disk, registry in an ini file, real processes and clock; message boxes answer by their
/// default button, progress and help viewer do nothing, timers never end: the program puts in its own.
std::unique_ptr<Environment> MakeRealEnvironment(const RealEnvironmentOptions& options = {});

} // namespace tovimar::platform
