// Measures the help project's files: a project file of many nodes loaded and saved, beside what the XML
// library alone takes to parse the same bytes with the same options; contents, index and checksums.
//
//     bench_project [NODES]             default 20000
//     bench_project NODES files         the project file alone
//
// Every figure is processor time, and the least of several runs: the one that other programs disturbed least.

#include "foundation/CAddInProjects.h"
#include "foundation/CXmlMessages.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/Memory.h"
#include "platform/xml/XmlCheck.h"
#include "project/CHelpPrjCheckSums.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/clsHHCLoader.h"
#include "project/clsHHK.h"

#include <pugixml.hpp>

#include <unistd.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <filesystem>
#include <functional>
#include <random>
#include <string>
#include <vector>

namespace fs = std::filesystem;
using namespace tovimar;

namespace {

/// The least processor time of several runs in milliseconds; `prepare` isn't measured.
double Least(
    int runs, const std::function<void()>& step, const std::function<void()>& prepare = [] {}) {
    double least = 1e12;
    for (int i = 0; i < runs; ++i) {
        prepare();
        const auto start = std::clock();
        step();
        const double took = 1000.0 * static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
        least = std::min(least, took);
    }
    return least;
}

std::string Attributes(int number, const char* kind) {
    const auto text = std::to_string(number);
    std::string out = " name='" + std::string(kind) + text + "' key='Sales." + kind + "_" + text +
                      "' caption='The " + kind + " of order number " + text + " &amp; what belongs to it' " +
                      "GeneratedHtmlFile='Sales_" + kind + "_" + text + ".htm'";
    if (number % 3 == 0)
        out += " Indexes='order|" + std::string(kind) + " " + text + "|number " +
               std::to_string(number % 1000) + "|what belongs to an order|customers and their addresses'";
    return out;
}

/// Groups of 200 nodes: a quarter of them objects, each with two pages of notes below it, the others pages.
std::string ProjectText(int nodes) {
    std::string out = "<TovimarProject><Project name='Sales' title='Sales help' key='Project'>";
    for (int made = 0; made < nodes;) {
        out += "<Forms" + Attributes(made++, "Group") + " ProcessCode='1' TemplateHtmlFile='Forms.htm'>";
        for (const int end = std::min(nodes, made + 199); made < end;) {
            if (made % 4 != 0) {
                out += "<Topic" + Attributes(made++, "Page") + " TemplateHtmlFile='Topic.htm'/>";
                continue;
            }
            const bool kept = made % 40 != 0;
            out += "<FORM type='2' ProcessCode='999' icon='form' title='Orders' TemplateHtmlFile='Form.htm'" +
                   Attributes(made++, "Form") + (kept ? ">" : " skipped='-1'>");
            for (int i = 0; i < 2 && made < end; ++i)
                out += "<Topic" + Attributes(made++, "Notes") + " TemplateHtmlFile='Topic.htm'/>";
            out += "</FORM>";
        }
        out += "</Forms>";
    }
    return out + "</Project></TovimarProject>";
}

void Line(const char* what, double milliseconds, double yardstick) {
    std::printf("%-44s %8.2f ms   %5.2f times the library's parsing\n", what, milliseconds,
                milliseconds / yardstick);
}

void MeasureProjectFile(const std::string& folder, int nodes) {
    constexpr int kRuns = 15;
    auto& files = *platform::Env().files;
    const auto path = folder + "Sales.tvp";
    files.WriteFile(path, ProjectText(nodes));
    {
        CHelpPrjTree tree;
        tree.Load(path);
        tree.SaveXml(path, /*vfSkipSerializers=*/true);
    }
    const auto bytes = files.ReadFile(path);
    // As XmlDocument calls it: the text is copied into the document's own buffer.
    const auto parse = [&] {
        pugi::xml_document document;
        document.load_buffer(bytes.data(), bytes.size(),
                             pugi::parse_default | pugi::parse_comments | pugi::parse_pi |
                                 pugi::parse_declaration,
                             pugi::encoding_utf8);
    };
    const double yardstick = Least(kRuns, parse);
    std::printf("project file of %d nodes, %.2f MB\n", nodes, static_cast<double>(bytes.size()) / 1e6);
    Line("the library's parsing (load_buffer)", yardstick, yardstick);
    Line("the file read", Least(kRuns, [&] { files.ReadFile(path); }), yardstick);
    Line("the text checked (CheckXml)", Least(kRuns, [&] { CheckXml(bytes); }), yardstick);
    std::unique_ptr<CHelpPrjTree> made;
    const auto fresh = [&] { made = std::make_unique<CHelpPrjTree>(); };
    const auto loadWithControls = [&] { made->Load(path, false, false, {}, /*vfLoadControls=*/true); };
    Line("CHelpPrjTree::Load with controls", Least(kRuns, loadWithControls, fresh), yardstick);
    Line("CHelpPrjTree::Load",
         Least(
             kRuns, [&] { made->Load(path); }, fresh),
         yardstick);
    auto& tree = *made;
    Line("CHelpPrjTree::SaveXml", Least(kRuns, [&] { tree.SaveXml(path, /*vfSkipSerializers=*/true); }),
         yardstick);
    if (files.ReadFile(path) != bytes)
        std::printf("THE SAVED FILE DIFFERS\n");
    Line("of it the text (GetXMLStr)", Least(kRuns, [&] { tree.GetXMLStr(true); }), yardstick);
    Line("CHelpPrjTree::GetHHCStr", Least(kRuns, [&] { tree.GetHHCStr(false); }), yardstick);
    Line("CHelpPrjTree::MakeAndSaveHHK", Least(kRuns, [&] { tree.MakeAndSaveHHK(folder + "Sales.hhk"); }),
         yardstick);
}

void MeasureIndex() {
    std::printf("index: AddCustomLink and HHKContents, in shuffled order, two links a keyword\n");
    for (const int entries : {1000, 10000, 100000, 1000000}) {
        std::vector<std::string> words;
        for (int i = 0; i < entries / 2; ++i)
            words.push_back("keyword of the application number " + std::to_string(i));
        words.insert(words.end(), words.begin(), words.end());
        std::shuffle(words.begin(), words.end(), std::mt19937(7));
        std::size_t bytes = 0;
        const double took = Least(entries > 100000 ? 2 : 5, [&] {
            clsHHK index;
            for (std::size_t i = 0; i < words.size(); ++i)
                index.AddCustomLink("Topic " + std::to_string(i), words[i], "topic.htm", "");
            bytes = index.HHKContents().size();
        });
        const double each = took * 1e6 / entries;
        std::printf("%8d entries %9.2f ms, %7.1f ns an entry, %5.1f ns an entry and log2 n, %.1f MB\n",
                    entries, took, each, each / std::log2(entries), static_cast<double>(bytes) / 1e6);
    }
}

void MeasureForeignContents(const std::string& folder) {
    std::string text = "<HTML>\r\n<BODY>\r\n<UL>\r\n";
    const auto entry = [](const std::string& name) {
        return "<LI> <OBJECT type=\"text/sitemap\">\r\n<param name=\"Name\" value=\"" + name +
               "\">\r\n<param name=\"Local\" value=\"t.htm\">\r\n</OBJECT>\r\n";
    };
    text += entry("Help") + "<UL>\r\n";
    for (int i = 1; i < 100000; ++i)
        text += entry("Topic " + std::to_string(i));
    const auto path = folder + "foreign.hhc";
    platform::Env().files->WriteFile(path, text + "</UL>\r\n</UL>\r\n</BODY>\r\n</HTML>\r\n");
    std::size_t bytes = 0;
    const double took = Least(3, [&] {
        clsHHCLoader loader;
        loader.Load(path);
        bytes = loader.GetXMLStr().size();
    });
    std::printf("foreign contents of 100000 entries to project text: %.1f ms, %.1f MB\n", took,
                static_cast<double>(bytes) / 1e6);
}

/// Which pages of a large help were edited: their checksums beside the mere reading of the same files.
void MeasureCheckSums(const std::string& folder) {
    constexpr int kPages = 10000;
    constexpr std::size_t kBytes = 8000;
    auto& files = *platform::Env().files;
    const auto pages = folder + "pages\\";
    files.MakeFolders(pages);
    std::mt19937 random(7);
    for (int i = 0; i < kPages; ++i) {
        std::string page(kBytes, 'x');
        for (std::size_t k = 0; k < kBytes; k += 16)
            page[k] = static_cast<char>('a' + random() % 26);
        files.WriteFile(pages + "page" + std::to_string(i) + ".htm", page);
    }
    CHelpPrjCheckSums saved;
    saved.Init(pages, pages, "Sales");
    saved.Recalc();
    saved.Save(true);
    files.WriteFile(pages + "page77.htm", "edited");
    const double reading = Least(5, [&] {
        for (const auto& name : files.ListFiles(pages, "*.htm"))
            files.ReadFile(pages + name);
    });
    std::size_t changed = 0;
    const double took = Least(5, [&] {
        CHelpPrjCheckSums sums;
        sums.Init(pages, pages, "Sales");
        sums.Recalc();
        changed = sums.ChangedFiles().size();
    });
    std::printf("%zu changed page of %d found in %.1f ms, %.2f times the reading of them (%.1f ms)\n",
                changed, kPages, took, took / reading, reading);
}

} // namespace

int main(int argc, char** argv) {
    platform::KeepFreedMemory();
    const fs::path memory = "/dev/shm";
    const fs::path work = (fs::exists(memory) ? memory : fs::temp_directory_path()) /
                          ("tovimar-bench-project-" + std::to_string(getpid()));
    fs::create_directories(work / "Sales");
    platform::RealEnvironmentOptions options;
    options.dataFolder = work / "data";
    options.configFolder = work / "config";
    options.programFolder = fs::path(TOVIMAR_SOURCE_DIR) / "install";
    platform::SetEnvironment(platform::MakeRealEnvironment(options));
    const auto folder = platform::Env().files->FromNative((work / "Sales").string()) + "\\";

    CTovimarParameters parameters;
    parameters.FillIndexFromAppObjectsAndControls = true;
    parameters.SetHelpProjectName("Sales");
    CXmlMessages messages;
    CAddInProjects projects;
    auto project = std::make_unique<CAddInProject>();
    project->Name = project->FileName = "Sales";
    project->Folder = folder;
    projects.SetCurrentProject(std::move(project));
    Session::SetParameters(&parameters);
    Session::SetProjects(&projects);
    Session::SetMessages(&messages);

    MeasureProjectFile(folder, argc > 1 ? std::atoi(argv[1]) : 20000);
    if (argc <= 2) {
        MeasureIndex();
        MeasureForeignContents(folder);
        MeasureCheckSums(folder);
    }
    fs::remove_all(work);
}
