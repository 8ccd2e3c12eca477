// The catalogue lies in the user's folder for years: any text loads, is repaired or is refused with a report.
// What was saved loads again with every project and is saved as the same text.

#include "MemoryFiles.h"
#include "QuietSurroundings.h"
#include "foundation/CAddInProjects.h"

namespace {

constexpr const char* kPath = "C:\\p.xml";

/// Every project file stands and tells a title and a folder of pictures.
class WithProjects : public tovimar::fuzz::MemoryFiles {
public:
    bool FileExists(const std::string& path) override {
        return path.ends_with(".tvp") || MemoryFiles::FileExists(path);
    }
    std::string ReadFile(const std::string& path) override {
        return path.ends_with(".tvp") ? "<TovimarProject><Project title=\"T\"/></TovimarProject>"
                                      : MemoryFiles::ReadFile(path);
    }
};

/// Loads the catalogue and saves it; the number of its projects, -1 when it doesn't load.
int Saves() {
    tovimar::CAddInProjects projects;
    if (projects.Init(kPath) != tovimar::kSuccess)
        return -1;
    if (projects.Save() != tovimar::kSuccess)
        __builtin_trap();
    projects.GetUniqueProjectName("Shop");
    int withFile = 0;
    projects.RemoveTempProjects();
    tovimar::CAddInProjects again;
    if (again.Init(kPath) == tovimar::kSuccess)
        withFile = again.Count();
    return withFile;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    auto made = std::make_unique<WithProjects>();
    auto& files = *made;
    files.WriteFile(kPath, tovimar::fuzz::Text(data, size));
    tovimar::platform::Env().files = std::move(made);
    const int count = Saves();
    if (count < 0)
        return 0;
    const std::string settled = files.ReadFile(kPath);
    if (Saves() != count || files.ReadFile(kPath) != settled)
        __builtin_trap();
    return 0;
}
