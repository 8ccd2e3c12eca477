// Projects for the help compiler are written by hand and by other tools: any bytes are read, and what is told
// of them names the project.

#include "helpcompiler/HelpProject.h"

#include <cstddef>
#include <cstdint>

using namespace tovimar::helpcompiler;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    ProjectFolder folder("/nonexistent");
    const HelpProject project = ReadHelpProject({reinterpret_cast<const char*>(data), size}, "p.hhp", folder,
                                                [](const Message& message) {
                                                    if (message.file != "p.hhp" || message.line < 0)
                                                        __builtin_trap();
                                                });
    if (project.help.language == 0 || project.help.codePage == 0 || project.compiledFile.empty())
        __builtin_trap();
    return 0;
}
