// Project files and definitions are files of a user: any text loads or gives a report, and what loads is
// written and loads again.

#include "platform/xml/XmlDocument.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::XmlDocument document;
    if (!document.loadXML({reinterpret_cast<const char*>(data), size}))
        return document.parseError().errorCode == 0 ? std::abort(), 1 : 0;
    tovimar::XmlDocument again;
    if (!again.loadXML(document.xml()))
        std::abort();
    return 0;
}
