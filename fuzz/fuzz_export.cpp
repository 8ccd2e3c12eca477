// Text exports come from anywhere: whatever bytes stand in one, reading ends with a design or with a message.

#include "platform/Error.h"
#include "platform/access/ExportReader.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace tovimar::platform::access;
    const std::string text = DecodeExportText({reinterpret_cast<const char*>(data), size});
    RecognizeExport(text);
    for (const ObjectKind kind : {ObjectKind::Form, ObjectKind::Report, ObjectKind::Macro}) {
        try {
            const auto design = ReadDesign(text, kind, "Fuzzed", "fuzzed.form");
            design->Sections();
            VisibleCode(design->code);
        } catch (const tovimar::RaisedError&) {
            continue;
        }
    }
    return 0;
}
