// Measures the help compiler against chmcmd, where that is installed: pages of words alone, the same with
// pictures that are compressed already, and the help of a real application.
//
//     bench_help [PAGES | PROJECT.hhp]...     default 340 3400, and sports-admin where it is at hand
//
// Seconds are those of the wall clock, and of all processors in parentheses: the least of three runs of ours,
// one of the other. Memory is the most that the process had at a time; it grows with the names and the index
// of words, not with the pictures.

#include "ChildRun.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <random>
#include <string>
#include <unistd.h>
#include <vector>

namespace fs = std::filesystem;
using tovimar::bench::ChildRun;
using tovimar::bench::RunProgram;

namespace {

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

/// Size of the one compiled help in a folder, in megabytes.
double CompiledMegabytes(const fs::path& folder) {
    for (const auto& entry : fs::directory_iterator(folder))
        if (entry.path().extension() == ".chm")
            return static_cast<double>(entry.file_size()) / 1e6;
    return 0;
}

struct Compiled {
    ChildRun run;
    double megabytes = 0;
};

Compiled CompileWith(const char* compiler, const fs::path& project, int times) {
    setenv("TOVIMAR_HELP_COMPILER", compiler, 1);
    Compiled best;
    best.run.seconds = best.run.processorSeconds = 1e9;
    for (int i = 0; i < times; ++i) {
        const ChildRun run = RunProgram({TOVIMAR_HELP_COMPILER, project.string()});
        best.run.seconds = std::min(best.run.seconds, run.seconds);
        best.run.processorSeconds = std::min(best.run.processorSeconds, run.processorSeconds);
        best.run.peakMegabytes = std::max(best.run.peakMegabytes, run.peakMegabytes);
        best.run.exitCode = run.exitCode;
    }
    best.megabytes = CompiledMegabytes(project.parent_path());
    return best;
}

void Print(const std::string& name, const Compiled& compiled) {
    std::printf("%-26s %7.2f s (%7.2f), %4.0f MB of memory, %8.3f MB compiled%s", name.c_str(),
                compiled.run.seconds, compiled.run.processorSeconds, compiled.run.peakMegabytes,
                compiled.megabytes, compiled.run.exitCode == 0 ? "" : " with complaints");
}

void Measure(const std::string& name, const fs::path& project) {
    const Compiled ours = CompileWith("", project, 3);
    Print(name, ours);
    std::printf("\n");
    if (RunProgram({"sh", "-c", "command -v chmcmd"}).exitCode != 0)
        return;
    const Compiled theirs = CompileWith("chmcmd", project, 1);
    Print("    chmcmd", theirs);
    std::printf(
        ": %.0f times as long (%.0f), ours is %.1f%% of its size\n", theirs.run.seconds / ours.run.seconds,
        theirs.run.processorSeconds / ours.run.processorSeconds, 100 * ours.megabytes / theirs.megabytes);
    std::fflush(stdout);
}

void MeasurePages(const fs::path& work, int pages) {
    for (const bool pictures : {false, true}) {
        const fs::path folder = work / "pages";
        fs::create_directories(folder);
        WriteProject(folder, pages, pictures);
        Measure(std::to_string(pages) + (pictures ? " pages with pictures" : " pages"), folder / "p.hhp");
        fs::remove_all(folder);
    }
}

void MeasureSample(const fs::path& work) {
    const fs::path application = fs::path(TOVIMAR_SOURCE_DIR) / "../shared/corpus/sports-admin";
    if (!fs::exists(application))
        return;
    setenv("TOVIMAR_INSTALL", (fs::path(TOVIMAR_SOURCE_DIR) / "install").c_str(), 0);
    setenv("XDG_DATA_HOME", (work / "data").c_str(), 1);
    setenv("XDG_CONFIG_HOME", (work / "config").c_str(), 1);
    const fs::path help = work / "help";
    RunProgram({TOVIMAR_PROGRAM, "generate", fs::canonical(application).string(), "--output", help.string(),
                "--copy-to", work.string(), "--no-compile"});
    if (fs::exists(help / "sports-admin.hhp"))
        Measure("sports-admin", help / "sports-admin.hhp");
    else
        std::puts("sports-admin: no help was written");
}

} // namespace

int main(int count, char** arguments) {
    std::string pattern = (fs::temp_directory_path() / "bench_helpXXXXXX").string();
    const fs::path work = mkdtemp(pattern.data());
    std::vector<std::string> asked(arguments + 1, arguments + count);
    if (asked.empty()) {
        MeasureSample(work);
        asked = {"340", "3400"};
    }
    for (const std::string& one : asked) {
        if (one.ends_with(".hhp"))
            Measure(fs::path(one).stem().string(), fs::absolute(one));
        else
            MeasurePages(work, std::max(1, std::atoi(one.c_str())));
    }
    fs::remove_all(work);
    return 0;
}
