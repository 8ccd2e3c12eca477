// What a database keeps in its storage is read by parsers of our own: whatever the bytes are, they end in a
// design or a failure with a text. A design that is read is also written as text and read back. The first
// byte chooses the kind of stream.

#include "QuietSurroundings.h"
#include "platform/Error.h"
#include "platform/access/ExportReader.h"
#include "platform/access/ExportTreeText.h"
#include "platform/access/database/Attachment.h"
#include "platform/access/database/BlobTree.h"
#include "platform/access/database/CompoundFile.h"
#include "platform/access/database/MacroGrid.h"
#include "platform/access/database/MemberList.h"
#include "platform/access/database/Storage.h"
#include "platform/access/database/VbaProject.h"

using namespace tovimar;
using namespace tovimar::platform::access;

namespace {

void ReadDesignBytes(std::string_view bytes) {
    auto design = ReadDesignBlob(bytes);
    if (bytes.size() > 400)
        MergeDelta(design, bytes.substr(bytes.size() / 2));
    const auto text = ExportTreeText(*BlobBlocks(design));
    ParseExportTree(text, "fuzzed");
}

void ReadMacroBytes(std::string_view bytes) {
    const auto grid = ReadMacroGrid(bytes);
    MacroEvent(grid);
    ParseExportTree(ExportTreeText(*MacroBlocks(grid)), "fuzzed");
}

void ReadCode(std::string_view bytes) {
    const Storage storage({{1, 1, true, "ROOT", {}},
                           {2, 1, true, "VBA", {}},
                           {3, 2, true, "VBAProject", {}},
                           {4, 3, true, "VBA", {}},
                           {5, 4, false, "dir", std::string(bytes)},
                           {6, 4, false, "A", std::string(bytes)}});
    ReadVbaProject(storage);
    UnpackCode(bytes);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0)
        return 0;
    fuzz::Prepare();
    const std::string_view bytes(reinterpret_cast<const char*>(data + 1), size - 1);
    try {
        switch (data[0] % 7) {
        case 0:
            ReadDesignBytes(bytes);
            break;
        case 1:
            ReadFolderNames(bytes);
            break;
        case 2:
            ReadMemberList(bytes, text::CodePage(932));
            break;
        case 3:
            ReadMacroBytes(bytes);
            break;
        case 4:
            ReadCode(bytes);
            break;
        case 5:
            ReadCompoundFile(bytes);
            break;
        default:
            AttachmentContent(bytes);
        }
    } catch (const RaisedError&) {
        return 0;
    }
    return 0;
}
