#include "helpcompiler/ProjectFolder.h"

#include "platform/text/Caseless.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <vector>

namespace tovimar::helpcompiler {
namespace fs = std::filesystem;
namespace {

int HexDigit(char c) {
    const char lower = text::CaselessAscii(c);
    if (c >= '0' && c <= '9')
        return c - '0';
    return lower >= 'a' && lower <= 'f' ? lower - 'a' + 10 : -1;
}

/// "a%20b" is "a b".
std::string Unescaped(std::string_view address) {
    std::string out;
    for (std::size_t i = 0; i < address.size(); ++i) {
        const bool whole = address[i] == '%' && i + 2 < address.size();
        const int high = whole ? HexDigit(address[i + 1]) : -1;
        const int low = whole ? HexDigit(address[i + 2]) : -1;
        if (high < 0 || low < 0) {
            out.push_back(address[i]);
            continue;
        }
        out.push_back(static_cast<char>(high * 16 + low));
        i += 2;
    }
    return out;
}

/// "http:", "mailto:", "C:"
bool HasScheme(std::string_view address) {
    const std::size_t colon = address.find(':');
    return colon != std::string_view::npos && address.find('/') > colon;
}

} // namespace

std::string WithSlashes(std::string_view name) {
    std::string out(name);
    std::replace(out.begin(), out.end(), '\\', '/');
    return out;
}

const ProjectFolder::Names& ProjectFolder::NamesIn(const fs::path& folder) {
    const auto [place, added] = listings_.try_emplace(folder.string());
    if (added) {
        std::error_code error;
        for (fs::directory_iterator entry(folder, error), end; !error && entry != end;
             entry.increment(error)) {
            const std::string name = entry->path().filename().string();
            // Of two names that differ in case alone the same one is taken on every machine.
            std::string& known = place->second[text::FoldCase(name)];
            if (known.empty() || name < known)
                known = name;
        }
    }
    return place->second;
}

std::optional<std::string> ProjectFolder::Find(std::string_view name) {
    fs::path found;
    for (const std::string& part : text::Split(WithSlashes(name), "/")) {
        if (part.empty() || part == ".")
            continue;
        if (part == "..") {
            found /= part;
            continue;
        }
        const Names& names = NamesIn(folder_ / found);
        const auto known = names.find(text::FoldCase(part));
        if (known == names.end())
            return std::nullopt;
        found /= fs::exists(folder_ / found / part) ? part : known->second;
    }
    std::error_code ignored;
    if (!fs::is_regular_file(folder_ / found, ignored))
        return std::nullopt;
    return found.generic_string();
}

std::optional<std::string> FileOfReference(std::string_view page, std::string_view target, bool& outside) {
    outside = false;
    const std::string address = Unescaped(WithSlashes(target.substr(0, target.find_first_of("#?"))));
    if (address.empty() || HasScheme(address) || address.starts_with("//"))
        return std::nullopt;
    std::vector<std::string> parts;
    const std::string folder(page.substr(0, page.find_last_of('/') + 1));
    for (const std::string& part : text::Split(address.starts_with('/') ? address : folder + address, "/")) {
        if (part == ".." && parts.empty())
            outside = true;
        else if (part == "..")
            parts.pop_back();
        else if (!part.empty() && part != ".")
            parts.push_back(part);
    }
    return text::Join(parts, "/");
}

std::string LowerExtension(std::string_view name) {
    const std::size_t point = name.find_last_of("./");
    if (point == std::string_view::npos || name[point] != '.')
        return {};
    std::string extension(name.substr(point + 1));
    std::transform(extension.begin(), extension.end(), extension.begin(), text::CaselessAscii);
    return extension;
}

} // namespace tovimar::helpcompiler
