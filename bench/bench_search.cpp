// Measures the search page of the web help: how long it is made, how large it is beside the text that it
// finds, and what one key typed into it takes in a real browser until its results are laid out.
//
//     bench_search [OBJECTS]            help of an invented application, default 5000
//     bench_search FOLDER               help that is there already

#include "SyntheticApplication.h"
#include "TopicText.h"
#include "browser/Browser.h"

#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <numeric>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

namespace fs = std::filesystem;
using namespace tovimar;

namespace {

void Run(const std::string& command) {
    if (std::system((command + " >/dev/null 2>&1").c_str()) != 0)
        throw std::runtime_error("failed: " + command);
}

fs::path GeneratedHelp(int objects, const fs::path& work) {
    bench::WriteSyntheticApplication(work / "app", objects);
    Run(std::string(TOVIMAR_PROGRAM) + " generate '" + (work / "app").string() + "' --output '" +
        (work / "help").string() + "' --no-compile");
    return work / "help";
}

struct Topics {
    std::size_t number = 0;
    double bytesOfText = 0;
};

Topics Count(const fs::path& help) {
    Topics topics;
    for (const auto& entry : fs::directory_iterator(help)) {
        if (entry.path().extension() != ".htm")
            continue;
        std::ostringstream bytes;
        bytes << std::ifstream(entry.path(), std::ios::binary).rdbuf();
        topics.bytesOfText += static_cast<double>(search::ReadTopic(bytes.str()).body.size());
        ++topics.number;
    }
    return topics;
}

void MeasureIndexer(const fs::path& help) {
    const auto start = std::chrono::steady_clock::now();
    Run(std::string(TOVIMAR_SS) + " '-d" + help.string() + "' -eHTM");
    const std::chrono::duration<double> took = std::chrono::steady_clock::now() - start;
    const Topics topics = Count(help);
    const auto page = static_cast<double>(fs::file_size(help / "ss.html"));
    std::printf("%zu topics, %.1f MB of text: indexed in %.2f s, search page %.2f MB, %.1f %% of the text\n",
                topics.number, topics.bytesOfText / 1e6, took.count(), page / 1e6,
                100 * page / topics.bytesOfText);
}

/// Milliseconds for each key of some searches: words, prefixes of one letter, several words, misspelt ones.
void MeasureKeys(const fs::path& help) {
    if (!test::Browser::IsInstalled()) {
        std::puts("no browser with its driver is installed: keys aren't measured");
        return;
    }
    test::Browser browser;
    browser.Go("file://" + (help / "ss.html").string());
    if (!browser.Until("ready!==null"))
        throw std::runtime_error("the search page wasn't ready");
    const auto times = browser
                           .Run("const times=[];"
                                "for(const typed of ['customer orders','delivery date of an order','quantty',"
                                "'form 12 name','report','the','adress of custmer','a b c d e f'])"
                                "  for(let n=1;n<=typed.length;n++){"
                                "    FIELD.value=typed.slice(0,n);const start=performance.now();"
                                "    NS();document.body.offsetHeight;times.push(performance.now()-start);}"
                                "return times;")
                           .get<std::vector<double>>();
    std::printf("a key: %.1f ms on average, %.1f ms at worst, of %zu\n",
                std::accumulate(times.begin(), times.end(), 0.0) / static_cast<double>(times.size()),
                *std::max_element(times.begin(), times.end()), times.size());
}

} // namespace

int main(int argc, char** argv) {
    const std::string argument = argc > 1 ? argv[1] : "5000";
    const fs::path work = fs::temp_directory_path() / ("tovimar-bench-" + std::to_string(getpid()));
    fs::create_directories(work);
    setenv("XDG_DATA_HOME", (work / "data").c_str(), 1);
    setenv("XDG_CONFIG_HOME", (work / "config").c_str(), 1);
    const fs::path help = fs::is_directory(argument) ? fs::canonical(argument)
                                                     : GeneratedHelp(std::atoi(argument.c_str()), work);
    MeasureIndexer(help);
    MeasureKeys(help);
    fs::remove_all(work);
}
