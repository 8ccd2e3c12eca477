// A whole database file: whatever is done to it, it is summarised or refused with a text that names it. The
// reader library works in a child process, so its crashes end there.

#include "QuietSurroundings.h"
#include "platform/Error.h"
#include "platform/access/AccessApplication.h"

#include <cstdlib>
#include <fstream>
#include <string>
#include <unistd.h>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    static const std::string path = "/tmp/tovimar-fuzz-" + std::to_string(getpid()) + ".accdb";
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    try {
        tovimar::platform::access::SummarizeApplication(path);
    } catch (const tovimar::RaisedError& failure) {
        if (std::string(failure.what()).find("tovimar-fuzz-") == std::string::npos)
            __builtin_trap();
    }
    unlink(path.c_str());
    return 0;
}
