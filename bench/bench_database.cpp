// Measures the reading of a database's designs beside the run that documents the database.
//
//     bench_database FILE...            default: the largest of the real ones beside the project
//
// Reading is done in a process of its own each time, so that its memory can be told: the most that it has,
// less what a process has that reads nothing.

#include "ChildRun.h"
#include "platform/Memory.h"
#include "platform/access/database/DatabaseDesigns.h"

#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <functional>
#include <string>
#include <vector>

namespace fs = std::filesystem;
using namespace tovimar::platform::access;

namespace {

using Clock = std::chrono::steady_clock;

double Seconds(const std::function<void()>& step) {
    const auto start = Clock::now();
    step();
    return std::chrono::duration<double>(Clock::now() - start).count();
}

double Least(const std::function<void()>& step) {
    constexpr int kRuns = 5;
    double least = 1e9;
    for (int i = 0; i < kRuns; ++i)
        least = std::min(least, Seconds(step));
    return least;
}

void ReadAll(const std::string& file) {
    DatabaseDesigns designs(file);
    for (const auto kind : {ObjectKind::Form, ObjectKind::Report, ObjectKind::Macro})
        for (const auto& name : designs.Names(kind))
            DesignOfTree(designs.Tree(kind, name), kind, name, file);
}

void Measure(const std::string& file) {
    const fs::path work = fs::temp_directory_path() / ("tovimar-bench-" + std::to_string(getpid()));
    fs::create_directories(work);
    setenv("XDG_DATA_HOME", (work / "data").c_str(), 1);
    setenv("XDG_CONFIG_HOME", (work / "config").c_str(), 1);
    const std::string command = std::string(TOVIMAR_PROGRAM) + " generate '" + file +
                                "' --no-compile --output '" + (work / "help").string() + "' --copy-to '" +
                                work.string() + "' >/dev/null 2>&1";
    const double reading = Least([&] { ReadAll(file); });
    const double run = Least([&] {
        fs::remove_all(work / "help");
        if (std::system(command.c_str()) != 0)
            std::puts("THE RUN FAILED");
    });
    const double size = static_cast<double>(fs::file_size(file));
    const auto peakOf = [](const std::function<void()>& step) {
        const auto child = tovimar::bench::RunInChild([&] {
            step();
            return 0;
        });
        return static_cast<long>(1024 * child.peakMegabytes);
    };
    const long peak = peakOf([&] { ReadAll(file); }) - peakOf([] {});
    std::printf(
        "%s: %.2f MB, designs read in %.1f ms, documented in %.0f ms: %.1f %%; memory %.1f times the file\n",
        fs::path(file).filename().c_str(), size / 1e6, reading * 1e3, run * 1e3, 100 * reading / run,
        1024.0 * static_cast<double>(peak) / size);
    fs::remove_all(work);
}

} // namespace

int main(int count, char** arguments) {
    tovimar::platform::KeepFreedMemory(); // as the program does
    std::vector<std::string> files(arguments + 1, arguments + count);
    const fs::path corpus = TOVIMAR_SOURCE_DIR "/../shared/corpus/access-forms";
    if (files.empty() && fs::exists(corpus))
        for (const auto& entry : fs::directory_iterator(corpus))
            files.push_back(fs::canonical(entry.path()).string());
    for (const std::string& file : files)
        Measure(file);
}
