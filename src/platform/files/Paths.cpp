#include "platform/files/Paths.h"

#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

namespace tovimar::platform {
namespace {

/// Position behind the folder part; the drive's colon counts as its end too ("C:file").
std::size_t NameStart(std::string_view path) {
    const auto at = path.find_last_of("\\/");
    if (at != std::string_view::npos)
        return at + 1;
    return path.size() >= 2 && path[1] == ':' ? 2 : 0;
}

/// Wildcards over folded characters. Only the last star needs to be tried again, so this is at worst the
/// product of both lengths.
bool Matches(std::u32string_view name, std::u32string_view pattern) {
    std::size_t n = 0, p = 0;
    std::size_t starAt = std::u32string_view::npos, retryAt = 0;
    while (n < name.size()) {
        if (p < pattern.size() && pattern[p] == U'*') {
            starAt = p++;
            retryAt = n;
        } else if (p < pattern.size() && (pattern[p] == U'?' || pattern[p] == name[n])) {
            ++p;
            ++n;
        } else if (starAt != std::u32string_view::npos) {
            p = starAt + 1;
            n = ++retryAt;
        } else {
            return false;
        }
    }
    while (p < pattern.size() && pattern[p] == U'*')
        ++p;
    return p == pattern.size();
}

} // namespace

std::string FolderOf(std::string_view path) {
    const std::size_t start = NameStart(path);
    std::string folder(path.substr(0, start));
    if (!folder.empty() && folder.back() == '/')
        folder.back() = '\\';
    return WithTrailingBackslash(folder);
}

std::string FileNameOf(std::string_view path) {
    return std::string(path.substr(NameStart(path)));
}

std::string BaseNameOf(std::string_view path) {
    const std::string name = FileNameOf(path);
    return name.substr(0, name.rfind('.'));
}

std::string ExtensionOf(std::string_view path) {
    const std::string name = FileNameOf(path);
    const auto dot = name.rfind('.');
    return dot == std::string::npos ? std::string() : name.substr(dot);
}

std::string WithTrailingBackslash(std::string_view path) {
    std::string out(path);
    if (!out.empty() && out.back() != '\\')
        out += '\\';
    return out;
}

std::string WithoutTrailingBackslash(std::string_view path) {
    if (!path.empty() && path.back() == '\\')
        path.remove_suffix(1);
    return std::string(path);
}

std::string Join(std::string_view folder, std::string_view name) {
    if (!folder.empty() && !name.empty() && name.front() == '\\')
        name.remove_prefix(1);
    return WithTrailingBackslash(folder) + std::string(name);
}

bool HasDrive(std::string_view path) {
    if (path.starts_with("\\\\"))
        return true;
    return path.size() >= 2 && path[1] == ':' && text::LowerAscii(path[0]) >= 'a' &&
           text::LowerAscii(path[0]) <= 'z';
}

bool HasFolder(std::string_view path) {
    return NameStart(path) > 0;
}

bool MatchesPattern(std::string_view name, std::string_view pattern) {
    if (pattern.empty() || pattern == "*" || pattern == "*.*")
        return true;
    return Matches(text::ToCodePoints(text::FoldCase(name)), text::ToCodePoints(text::FoldCase(pattern)));
}

} // namespace tovimar::platform
