#include "platform/files/DiskFileSystem.h"
#include "platform/files/FileFailure.h"
#include "platform/files/Paths.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <dirent.h>
#include <sys/stat.h>

/// From Windows paths to native ones and back. A path that stands as it is written costs one look at the
/// disk; otherwise its parts are found one by one, without regard to case.
namespace tovimar::platform {
namespace {

/// Folders whose names are kept; more only happens to programs that walk the whole machine.
constexpr std::size_t kMaxListings = 64;

bool SameTime(const std::timespec& left, const std::timespec& right) {
    return left.tv_sec == right.tv_sec && left.tv_nsec == right.tv_nsec;
}

bool Exists(const std::string& nativePath) {
    struct stat info {};
    return stat(nativePath.c_str(), &info) == 0;
}

/// Takes "." and ".." out; ".." at the root of a drive stays there.
std::vector<std::string> Parts(std::string_view path) {
    std::vector<std::string> parts;
    std::size_t begin = 0;
    while (begin <= path.size()) {
        const auto end = std::min(path.find_first_of("\\/", begin), path.size());
        const std::string_view part = path.substr(begin, end - begin);
        if (part == "..") {
            if (!parts.empty())
                parts.pop_back();
        } else if (!part.empty() && part != ".") {
            parts.emplace_back(part);
        }
        begin = end + 1;
    }
    return parts;
}

std::string JoinNative(const std::string& folder, std::string_view name) {
    return folder.ends_with('/') ? folder + std::string(name) : folder + "/" + std::string(name);
}

} // namespace

DiskFileSystem::DiskFileSystem(std::string driveC)
    : driveC_(std::filesystem::absolute(driveC).lexically_normal().string()) {
    while (driveC_.size() > 1 && driveC_.ends_with('/'))
        driveC_.pop_back();
}

/// Native folder of the path's drive; raises 76 for drives that don't exist here.
std::string DiskFileSystem::MapDrive(const std::string& path) const {
    if (!HasDrive(path))
        return std::filesystem::current_path().string();
    const char drive = text::LowerAscii(path[0]);
    if (drive == 'z')
        return "/";
    if (drive != 'c')
        RaiseFileNumber(kPathNotFound, path);
    return driveC_;
}

std::string DiskFileSystem::Resolve(const std::string& path) {
    const std::string root = MapDrive(path);
    const auto parts = Parts(HasDrive(path) ? std::string_view(path).substr(2) : std::string_view(path));
    std::string folder = root;
    for (std::size_t i = 0; i + 1 < parts.size(); ++i)
        folder = JoinNative(folder, parts[i]);
    if (parts.empty() || Exists(JoinNative(folder, parts.back())))
        return parts.empty() ? root : JoinNative(folder, parts.back());
    // Mostly the folder stands as it is written and only the file is missing.
    if (Exists(folder))
        return ResolveBelow(folder, {parts.back()});
    return ResolveBelow(root, parts);
}

/// Part by part; what is missing stays as it is written.
std::string DiskFileSystem::ResolveBelow(std::string folder, const std::vector<std::string>& parts) {
    bool missing = false;
    for (const auto& part : parts) {
        const std::string name = missing ? std::string() : FindName(folder, part);
        missing = name.empty();
        folder = JoinNative(folder, missing ? part : name);
    }
    return folder;
}

/// The entry's own name; empty when the folder has none of that name in any case.
std::string DiskFileSystem::FindName(const std::string& folder, const std::string& name) {
    if (Exists(JoinNative(folder, name)))
        return name;
    struct stat info {};
    if (stat(folder.c_str(), &info) != 0)
        return {};
    const auto& names = ListingOf(folder, info.st_mtim).names;
    const auto found = names.find(text::FoldCase(name));
    if (found == names.end() || !Exists(JoinNative(folder, found->second)))
        return {};
    return found->second;
}

DiskFileSystem::Listing& DiskFileSystem::ListingOf(const std::string& folder, const std::timespec& modified) {
    if (listings_.size() >= kMaxListings && !listings_.contains(folder))
        listings_.clear();
    Listing& listing = listings_[folder];
    if (!listing.names.empty() && SameTime(listing.modified, modified))
        return listing;
    listing = {modified, {}};
    if (DIR* entries = opendir(folder.c_str())) {
        while (const dirent* entry = readdir(entries)) {
            const std::string name = entry->d_name;
            // Of names that differ in case alone the first by bytes is the one that answers.
            auto& kept = listing.names[text::FoldCase(name)];
            if (kept.empty() || name < kept)
                kept = name;
        }
        closedir(entries);
    }
    return listing;
}

/// Keeps the known names of the entry's folder up with a change of our own.
void DiskFileSystem::NoteEntry(const std::string& nativePath, bool present) {
    const auto slash = nativePath.rfind('/');
    const std::string folder = nativePath.substr(0, std::max<std::size_t>(slash, 1));
    const auto known = listings_.find(folder);
    if (known == listings_.end())
        return;
    struct stat info {};
    if (stat(folder.c_str(), &info) != 0) {
        listings_.erase(known);
        return;
    }
    const std::string name = nativePath.substr(slash + 1);
    if (present)
        known->second.names.insert_or_assign(text::FoldCase(name), name);
    else
        known->second.names.erase(text::FoldCase(name));
    known->second.modified = info.st_mtim;
}

std::string DiskFileSystem::ToNative(const std::string& path) {
    if (path.empty())
        return {};
    if (path.starts_with("\\\\") ||
        (HasDrive(path) && text::LowerAscii(path[0]) != 'c' && text::LowerAscii(path[0]) != 'z'))
        return path;
    std::string native = Resolve(path);
    if (path.ends_with('\\') && !native.ends_with('/'))
        native += '/';
    return native;
}

std::string DiskFileSystem::FromNative(const std::string& nativePath) {
    if (nativePath.empty())
        return {};
    std::string path = std::filesystem::absolute(nativePath).lexically_normal().string();
    std::string prefix = "Z:";
    if (path == driveC_ || path.starts_with(driveC_ + "/")) {
        path.erase(0, driveC_.size());
        prefix = "C:";
        if (path.empty())
            path = "/";
    }
    for (char& byte : path)
        if (byte == '/')
            byte = '\\';
    return prefix + path;
}

} // namespace tovimar::platform
