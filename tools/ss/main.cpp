#include "SearchIndex.h"
#include "SearchPage.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <stdexcept>
#include <string>
#include <string_view>
#include <system_error>
#include <vector>

namespace fs = std::filesystem;
using namespace tovimar;

namespace {

const char* const kUsage =
    "Usage: ss.exe -d\"FOLDER\" [-eEXTENSION] [-iFILE]... [-x]\n"
    "Writes ss.html into the folder: a search page over its files with the extension (htm).\n"
    "  -iFILE   leaves a file out; may stand several times\n"
    "  -s -w -p -m -u -n with a number, and -x, are accepted and mean nothing here.\n";

constexpr std::uintmax_t kLargestTopic = 64U << 20U;

struct Options {
    fs::path folder;
    std::string extension = ".htm";
    std::vector<std::string> excluded;
};

/// A folder may come as a path of this machine or as "Z:\..." with its root as drive Z.
fs::path NativeFolder(std::string path) {
    path.erase(std::remove(path.begin(), path.end(), '"'), path.end());
    if (path.size() >= 2 && (path[0] == 'Z' || path[0] == 'z') && path[1] == ':') {
        path.erase(0, 2);
        std::replace(path.begin(), path.end(), '\\', '/');
        if (path.empty() || path[0] != '/')
            path.insert(path.begin(), '/');
    }
    return path;
}

/// False for an argument that isn't one of the known ones. File names come without quotes: a piece
/// without a dash goes on with the name before it, behind the blank that parted them.
bool ReadArgument(std::string_view argument, Options& options) {
    if (!argument.empty() && argument[0] != '-' && !options.excluded.empty()) {
        options.excluded.back().append(1, ' ').append(argument);
        return true;
    }
    if (argument.size() < 2 || argument[0] != '-')
        return false;
    const std::string value(argument.substr(2));
    switch (argument[1]) {
    case 'd':
        options.folder = NativeFolder(value);
        return !value.empty();
    case 'e':
        options.extension = '.' + value;
        return !value.empty();
    case 'i':
        options.excluded.push_back(value);
        return true;
    default:
        return std::string_view("swpmunx").find(argument[1]) != std::string_view::npos;
    }
}

bool IsExcluded(const std::string& name, const Options& options) {
    return std::any_of(options.excluded.begin(), options.excluded.end(),
                       [&](const std::string& excluded) { return text::EqualsIgnoringCase(name, excluded); });
}

/// Sorted without regard to case, so that the page doesn't depend on the file system.
std::vector<std::string> TopicNames(const Options& options) {
    std::vector<std::string> names;
    for (const auto& entry : fs::directory_iterator(options.folder)) {
        const auto name = entry.path().filename().string();
        if (entry.is_regular_file() && text::EndsWithIgnoringCase(name, options.extension) &&
            !IsExcluded(name, options))
            names.push_back(name);
    }
    std::sort(names.begin(), names.end(), [](const std::string& left, const std::string& right) {
        const auto order = text::CompareIgnoringCase(left, right);
        return order != 0 ? order < 0 : left < right;
    });
    return names;
}

std::runtime_error Failure(const fs::path& path, const std::string& what, int reason) {
    return std::runtime_error("'" + path.string() + "' " + what +
                              (reason == 0 ? "" : ": " + std::generic_category().message(reason)));
}

std::string ReadFile(const fs::path& path) {
    errno = 0;
    std::ifstream in(path, std::ios::binary);
    if (!in)
        throw Failure(path, "can't be read", errno);
    if (fs::file_size(path) > kLargestTopic)
        throw Failure(path, "is too large for a topic: more than 64 MB", 0);
    std::string bytes(std::istreambuf_iterator<char>(in), {});
    if (in.bad())
        throw Failure(path, "can't be read", errno);
    return bytes;
}

/// The page appears as a whole or not at all.
void WritePage(const fs::path& path, const std::string& page) {
    auto temporary = path;
    temporary += ".tmp";
    errno = 0;
    std::ofstream out(temporary, std::ios::binary | std::ios::trunc);
    out << page;
    out.close();
    if (!out)
        throw Failure(temporary, "can't be written", errno);
    std::error_code failed;
    fs::rename(temporary, path, failed);
    if (!failed)
        return;
    std::error_code ignored;
    fs::remove(temporary, ignored);
    throw Failure(path, "can't be replaced", failed.value());
}

void Run(const Options& options) {
    if (!fs::is_directory(options.folder))
        throw Failure(options.folder, "is no folder", 0);
    search::SearchIndex index;
    for (const auto& name : TopicNames(options))
        index.AddPage(text::MakeValidUtf8(name), search::ReadTopic(ReadFile(options.folder / name)));
    WritePage(options.folder / "ss.html", search::SearchPageText(index));
}

} // namespace

int main(int argc, char** argv) {
    Options options;
    for (int i = 1; i < argc; ++i)
        if (!ReadArgument(argv[i], options)) {
            std::cerr << "Unknown argument: " << argv[i] << '\n' << kUsage;
            return 2;
        }
    if (options.folder.empty()) {
        std::cerr << kUsage;
        return 2;
    }
    try {
        Run(options);
    } catch (const std::exception& failure) {
        std::cerr << "ss.exe: " << failure.what() << '\n';
        return 1;
    }
    return 0;
}
