// An ini file of any bytes is read, and what is written of it reads as the same sections and items again.

#include "MemoryFiles.h"
#include "QuietSurroundings.h"
#include "foundation/CN_IniFile.h"

namespace {

constexpr const char* kPath = "C:\\a.ini";

std::string Content(tovimar::CN_IniFile& ini) {
    std::string content;
    for (const auto& section : ini.Sections())
        content += "[" + section->Name() + "]\r\n" + section->SectionContent();
    return content;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    tovimar::fuzz::FilesWith(kPath, tovimar::fuzz::Text(data, size));
    tovimar::CN_IniFile ini;
    ini.SetName(kPath);
    ini.Save();
    tovimar::CN_IniFile again;
    again.SetName(kPath);
    if (Content(again) != Content(ini))
        __builtin_trap();
    return 0;
}
