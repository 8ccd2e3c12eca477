// database_streams FILE DIR: writes the streams of a database's storage as seeds of the target "design", each
// behind the byte that chooses its parser there.

#include "platform/access/database/DatabaseDesigns.h"
#include "platform/access/database/StorageReader.h"

#include <filesystem>
#include <fstream>
#include <iostream>

using namespace tovimar::platform::access;

int main(int count, char** arguments) {
    if (count != 3)
        return 2;
    DatabaseDesigns designs(arguments[1]);
    int number = 0;
    const auto write = [&](char parser, std::string_view bytes) {
        if (!bytes.empty() && bytes.size() < 60000)
            std::ofstream(
                std::filesystem::path(arguments[2]) /
                    (std::filesystem::path(arguments[1]).stem().string() + std::to_string(number++)),
                std::ios::binary)
                << parser << bytes;
    };
    for (const auto kind : {ObjectKind::Form, ObjectKind::Report})
        for (const auto& name : designs.Names(kind)) {
            write(0, designs.Blob(kind, name));
            write(2, designs.MemberBytes(kind, name));
        }
    for (const auto& name : designs.Names(ObjectKind::Macro))
        write(3, designs.Blob(ObjectKind::Macro, name));
    const auto stored = ReadStorage(arguments[1]);
    for (const auto* container : {"Forms", "Reports"})
        if (const auto* names = stored.tree.Find({container, "\x03"
                                                             "DirData"}))
            write(1, names->bytes);
    if (const auto* dir = stored.tree.Find({"VBA", "VBAProject", "VBA", "dir"}))
        write(4, dir->bytes);
    return 0;
}
