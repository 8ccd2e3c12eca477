// Measures the help compiler against chmcmd, where that is installed: pages of words alone, and the same with
// pictures that are compressed already.
//
//     bench_help [PAGES]             default 340
//
// Figures are seconds of the wall clock, the least of three runs; the other compiler runs once.

#include "helpcompiler/Compiler.h"

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
#include <random>
#include <string>
#include <unistd.h>

namespace fs = std::filesystem;
using namespace tovimar::helpcompiler;

namespace {

double Seconds(const std::function<void()>& step) {
    const auto start = std::chrono::steady_clock::now();
    step();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

void Write(const fs::path& path, const std::string& bytes) {
    std::ofstream(path, std::ios::binary) << bytes;
}

std::string PageOf(int number, bool picture, std::minstd_rand& random) {
    std::string page = "<html><head><title>Page " + std::to_string(number) + "</title></head><body>";
    for (int paragraph = 0; paragraph < 20; ++paragraph) {
        page += "<p>";
        for (int word = 0; word < 60; ++word)
            page += "w" + std::to_string(random() % 20000) + " ";
    }
    if (picture)
        page += "<img src=\"p" + std::to_string(number) + ".jpg\">";
    return page + "</body></html>";
}

void WriteProject(const fs::path& folder, int pages, bool pictures) {
    std::minstd_rand random(1);
    std::string project = "[OPTIONS]\nCompiled file=p.chm\nFull-text search=Yes\n[FILES]\n";
    for (int i = 0; i < pages; ++i) {
        const std::string name = "p" + std::to_string(i);
        Write(folder / (name + ".htm"), PageOf(i, pictures, random));
        project += name + ".htm\n" + (pictures ? name + ".jpg\n" : "");
        std::string picture;
        while (pictures && picture.size() < 40000)
            picture.push_back(static_cast<char>(random() >> 8U));
        if (pictures)
            Write(folder / (name + ".jpg"), picture);
    }
    Write(folder / "p.hhp", project);
}

void Measure(const fs::path& folder, int pages, bool pictures) {
    WriteProject(folder, pages, pictures);
    double ours = 1e9;
    std::uintmax_t size = 0;
    for (int i = 0; i < 3; ++i)
        ours = std::min(ours,
                        Seconds([&] { size = Compile(folder / "p.hhp", {}, [](const Message&) {}).bytes; }));
    std::printf("%5d pages%s: %7.2f s, %ju bytes\n", pages, pictures ? " with pictures" : "", ours, size);
    const std::string other = "cd '" + folder.string() + "' && chmcmd p.hhp >/dev/null 2>&1";
    int code = 0;
    const double theirs = Seconds([&] { code = std::system(other.c_str()); });
    if (code == 0)
        std::printf("             chmcmd: %7.2f s, %ju bytes; %.0f times as long\n", theirs,
                    fs::file_size(folder / "p.chm"), theirs / ours);
}

} // namespace

int main(int count, char** arguments) {
    const int pages = count > 1 ? std::max(1, std::atoi(arguments[1])) : 340;
    std::string pattern = (fs::temp_directory_path() / "bench_helpXXXXXX").string();
    const fs::path folder = mkdtemp(pattern.data());
    Measure(folder, pages, false);
    Measure(folder, pages, true);
    fs::remove_all(folder);
    return 0;
}
