// Settings files are edited by hand: any text loads into the options or is refused, the parameters stay
// whole, and what was saved loads again. From the second saving on the text stays the same.

#include "MemoryFiles.h"
#include "QuietSurroundings.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimarParameters.h"

namespace {

constexpr const char* kPath = "C:\\s.xml";

/// Loads the file and saves what was loaded over it; false when it doesn't load.
bool Saves() {
    tovimar::CTovimarParameters parameters;
    tovimar::Session::SetParameters(&parameters);
    tovimar::CAddInSettingsXmlFile settings;
    bool saved = false;
    if (settings.Load(kPath, /*vfLoadFromProjectFile=*/false) == tovimar::kSuccess)
        // A name that would break the file is told of, and the old file stands.
        saved = settings.Save(kPath) == tovimar::kSuccess;
    tovimar::Session::SetParameters(nullptr);
    return saved;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    tovimar::RegisterSettingsLoader();
    auto& files = tovimar::fuzz::FilesWith(kPath, tovimar::fuzz::Text(data, size));
    if (!Saves())
        return 0;
    // Folders are completed with what stands in each other, once.
    if (!Saves())
        __builtin_trap();
    const std::string settled = files.ReadFile(kPath);
    if (!Saves() || files.ReadFile(kPath) != settled)
        __builtin_trap();
    return 0;
}
