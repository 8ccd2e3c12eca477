// Measures a whole run without the compiler, and a yardstick of the machine beside it: writing the same bytes
// to the same disk and encoding the same pictures with the JPEG library alone.
//
//     bench_generation [OBJECTS...]     default 1000 10000, and sports-admin where it is at hand
//     bench_generation topic            one topic of a form with 100 controls

#include "ChildRun.h"
#include "SyntheticApplication.h"

#include "foundation/Session.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarParameters.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/AutomationObject.h"
#include "platform/Environment.h"
#include "platform/Memory.h"
#include "platform/access/AccessApplication.h"
#include "platform/files/Paths.h"
#include "platform/windowing/WindowSystem.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "screenshots/Screenshot.h"
#include "uimodel/CXmlForm.h"

#include <turbojpeg.h>

#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>
#include <vector>

namespace fs = std::filesystem;
using namespace tovimar;

namespace {

class Stopwatch {
public:
    double Seconds() const {
        return std::chrono::duration<double>(std::chrono::steady_clock::now() - start_).count();
    }

private:
    std::chrono::steady_clock::time_point start_ = std::chrono::steady_clock::now();
};

bench::ChildRun Generate(const fs::path& source, const fs::path& output) {
    const auto run = bench::RunProgram(
        {TOVIMAR_PROGRAM, "generate", source.string(), "--output", output.string(), "--no-compile"});
    if (run.exitCode != 0)
        std::fprintf(stderr, "the run ended with %d\n", run.exitCode);
    return run;
}

std::string ReadAll(const fs::path& path) {
    std::ifstream in(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
}

struct Floor {
    std::size_t files = 0, bytes = 0, pictures = 0;
    double writing = 0, encoding = 0;
};

/// Encodes the decoded pixels of one picture anew, at the quality that a run uses; seconds.
double EncodeAgain(tjhandle decoder, tjhandle encoder, const std::string& jpeg) {
    const auto* data = reinterpret_cast<const unsigned char*>(jpeg.data());
    int width = 0, height = 0, sampling = 0, colours = 0;
    if (tjDecompressHeader3(decoder, data, jpeg.size(), &width, &height, &sampling, &colours) != 0)
        return 0;
    std::vector<unsigned char> pixels(static_cast<std::size_t>(width) * static_cast<std::size_t>(height) * 3);
    tjDecompress2(decoder, data, jpeg.size(), pixels.data(), width, 0, height, TJPF_BGR, 0);
    unsigned char* encoded = nullptr;
    unsigned long size = 0;
    const Stopwatch watch;
    tjCompress2(encoder, pixels.data(), width, 0, height, TJPF_BGR, &encoded, &size, sampling, 100, 0);
    const double seconds = watch.Seconds();
    tjFree(encoded);
    return seconds;
}

Floor MeasureFloor(const fs::path& output, const fs::path& copy) {
    Floor floor;
    std::vector<std::pair<fs::path, std::string>> files;
    for (const auto& entry : fs::recursive_directory_iterator(output))
        if (entry.is_regular_file())
            files.emplace_back(copy / fs::relative(entry.path(), output), ReadAll(entry.path()));
    for (const auto& [path, bytes] : files)
        fs::create_directories(path.parent_path());

    const Stopwatch watch;
    for (const auto& [path, bytes] : files)
        std::ofstream(path, std::ios::binary) << bytes;
    floor.writing = watch.Seconds();

    tjhandle decoder = tjInitDecompress();
    tjhandle encoder = tjInitCompress();
    for (const auto& [path, bytes] : files) {
        ++floor.files;
        floor.bytes += bytes.size();
        if (path.extension() == ".jpg") {
            ++floor.pictures;
            floor.encoding += EncodeAgain(decoder, encoder, bytes);
        }
    }
    tjDestroy(decoder);
    tjDestroy(encoder);
    return floor;
}

/// Opens, paints and closes each form and report as a run does, and nothing else.
double MeasurePainting(const fs::path& source) {
    platform::SetEnvironment(platform::MakeRealEnvironment());
    const HostObject application = platform::access::OpenAccessApplication(source.string());
    const HostObject project = application->Get("CurrentProject").AsObject();
    const HostObject command = application->Get("DoCmd").AsObject();
    const Stopwatch watch;
    for (const auto& [all, open, opened, type, view] :
         {std::tuple{"AllForms", "OpenForm", "Forms", 2, 0},
          std::tuple{"AllReports", "OpenReport", "Reports", 3, 2}}) {
        const HostObject objects = project->Get(all).AsObject();
        const int count = objects->Get("Count").AsInteger();
        for (int i = 0; i < count; ++i) {
            const Value name = objects->Get("Item", {Value(i)}).AsObject()->Get("Name");
            try {
                command->Call(open, {name, Value(view)});
                const auto window = application->Get(opened, {name}).AsObject()->Get("hWnd").AsInteger();
                platform::Env().windows->Capture(window, false, 0, 0, 100000, 1);
                command->Call("Close", {Value(type), name, Value(2)});
            } catch (const RaisedError&) {
                continue; // an object whose design isn't known has no picture in a run either
            }
        }
    }
    return watch.Seconds();
}

void Measure(const char* name, const fs::path& source, const fs::path& work) {
    const fs::path output = work / "out";
    fs::remove_all(output);
    fs::remove_all(work / "copy");
    const bench::ChildRun run = Generate(source, output);
    const Floor floor = MeasureFloor(output, work / "copy");
    const double painting = MeasurePainting(source);
    const double floorSeconds = floor.writing + floor.encoding;
    const auto share = [&](double seconds) { return 100 * seconds / run.seconds; };
    std::printf("%-14s run %7.2f s (processor %.2f s), peak %.0f MB, %zu files, %.1f MB, %zu pictures\n",
                name, run.seconds, run.processorSeconds, run.peakMegabytes, floor.files,
                static_cast<double>(floor.bytes) / 1e6, floor.pictures);
    std::printf(
        "%-14s painting %.2f s (%.0f%%), JPEG %.2f s (%.0f%%), rendering and the rest %.2f s (%.0f%%)\n", "",
        painting, share(painting), floor.encoding, share(floor.encoding),
        run.seconds - painting - floor.encoding, share(run.seconds - painting - floor.encoding));
    std::printf("%-14s floor %.2f s (writing %.2f s, encoding %.2f s): ratio %.1f\n", "", floorSeconds,
                floor.writing, floor.encoding, run.seconds / floorSeconds);
    std::fflush(stdout);
}

/// Where one form's time goes, in seconds for all forms together.
struct Stages {
    double capturing = 0; ///< opened, walked, measured, made a definition
    double picturing = 0; ///< painted, encoded, written
    double rendering = 0; ///< the topic's text, read back and written
    double Sum() const { return capturing + picturing + rendering; }
};

/// Retakes pictures and topics of a generated project in this process, as a run does for each object.
Stages MeasureStages(const fs::path& source, const fs::path& project) {
    platform::RealEnvironmentOptions options;
    options.programFolder = fs::path(TOVIMAR_SOURCE_DIR) / "install";
    platform::SetEnvironment(platform::MakeRealEnvironment(options));
    auto& files = *platform::Env().files;
    RegisterSettingsLoader();
    CTovimarClient client;
    client.Connect(platform::access::OpenAccessApplication(source.string()));
    Screenshot screenshot;
    screenshot.LoadProject(files.FromNative(project.string()));
    std::vector<CHelpPrjTreeNode*> nodes;
    Session::HelpProjectTree()->CollectObjectNodes(nodes);
    const auto& parameters = *Session::Parameters();
    Stages stages;
    for (const auto* node : nodes) {
        const std::string topic = node->GeneratedHTMLFileFullPath();
        const std::string picture =
            parameters.FolderForGeneratedImages() + platform::BaseNameOf(node->GeneratedHTMLFile()) + ".jpg";
        const Stopwatch capturing;
        const auto form = Session::Generator()->CreateNormalizedXmlDef(
            node->ObjectType(), node->Name(), 0, true, false, 2, picture, topic, false, {}, true);
        stages.capturing += capturing.Seconds();
        const Stopwatch picturing;
        screenshot.LocateObjectsAndTakeScreenshots("jpg", form->hWnd, *form);
        stages.picturing += picturing.Seconds();
        const Stopwatch rendering;
        form->SaveHTMLEx(topic, /*HtmlOfReport=*/false);
        stages.rendering += rendering.Seconds();
        Session::ServerAgent()->CloseComponent(node->ObjectType(), node->Name(), false);
    }
    return stages;
}

/// What one form of 100 controls costs, the least of several runs: the one that other programs disturbed
/// least.
void MeasureTopic(const fs::path& work) {
    constexpr int kForms = 200, kRuns = 5;
    const fs::path source = work / "many", project = work / "out0" / "many.tvp";
    bench::WriteLargeForms(source, kForms);
    bench::ChildRun run{1e9};
    Stages stages{1e9, 0, 0};
    double encoding = 1e9;
    for (int i = 0; i < kRuns; ++i) {
        // Folders of their own: a file system may be slow where files have just been deleted.
        const fs::path output = work / ("out" + std::to_string(i));
        if (const bench::ChildRun one = Generate(source, output); one.seconds < run.seconds)
            run = one;
        encoding = std::min(encoding, MeasureFloor(output, work / ("copy" + std::to_string(i))).encoding);
        if (const Stages one = MeasureStages(source, project); one.Sum() < stages.Sum())
            stages = one;
    }
    const auto each = [](double seconds) { return 1000 * seconds / kForms; };
    std::printf("form of 100 controls: captured %.2f ms, painted, encoded and written %.2f ms, rendered "
                "%.2f ms; JPEG encoding alone %.2f ms: ratio %.2f\n",
                each(stages.capturing), each(stages.picturing), each(stages.rendering), each(encoding),
                stages.Sum() / encoding);
    std::printf("a whole run, with contents, index, web help and files: %.2f ms a form, ratio %.2f\n",
                each(run.seconds), run.seconds / encoding);
}

} // namespace

int main(int argc, char** argv) {
    platform::KeepFreedMemory();
    const bool ofTopic = argc == 2 && std::string(argv[1]) == "topic";
    // A topic's stages are measured without the disk, where the machine has a folder in memory.
    const fs::path memory = "/dev/shm";
    const fs::path work = (ofTopic && fs::exists(memory) ? memory : fs::temp_directory_path()) /
                          ("tovimar-bench-" + std::to_string(getpid()));
    fs::create_directories(work);
    // The user's catalogue and registry stay out of it.
    setenv("XDG_DATA_HOME", (work / "data").c_str(), 1);
    setenv("XDG_CONFIG_HOME", (work / "config").c_str(), 1);

    if (ofTopic) {
        MeasureTopic(work);
        fs::remove_all(work);
        return 0;
    }
    const fs::path corpus = fs::path(TOVIMAR_SOURCE_DIR) / "../shared/corpus/sports-admin";
    if (argc == 1 && fs::exists(corpus))
        Measure("sports-admin", fs::canonical(corpus), work);
    std::vector<int> counts;
    for (int i = 1; i < argc; ++i)
        counts.push_back(std::atoi(argv[i]));
    if (counts.empty())
        counts = {1000, 10000};
    for (const int count : counts) {
        const fs::path source = work / ("app" + std::to_string(count));
        bench::WriteSyntheticApplication(source, count);
        Measure((std::to_string(count) + " objects").c_str(), source, work);
    }
    fs::remove_all(work);
}
