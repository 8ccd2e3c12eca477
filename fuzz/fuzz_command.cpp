// Commands carry names and texts of the application: any text reads as a command, and what a command writes
// reads back with the same name, parameters and values.

#include "QuietSurroundings.h"
#include "host/server/CXmlCommand.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    tovimar::CXmlCommand command;
    command.Deserialize(tovimar::fuzz::Text(data, size));
    command.AddParamValue("RetValue", std::string(tovimar::fuzz::Text(data, size)));
    // The text is carried as it stands, and only its first node is read back from a well-formed command.
    command.Text.clear();
    const std::string written = command.Serialize();
    tovimar::CXmlCommand again;
    again.Deserialize(written);
    if (again.Serialize() != written)
        __builtin_trap();
    return 0;
}
